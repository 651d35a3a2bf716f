#include "office/dispatch/PowerPointObjects.h"

namespace powerpoint {

void PrintOptions::PutActivePrinter(LPCTSTR name) {
    Put(2015, VTS_BSTR, name);
}

void PrintOptions::PutPrintColorType(LONG type) {
    Put(2002, VTS_I4, type);
}

void PrintOptions::PutPrintInBackground(LONG inBackground) {
    Put(2010, VTS_I4, inBackground);
}

void PrintOptions::PutOutputType(LONG type) {
    Put(2007, VTS_I4, type);
}

void PrintOptions::PutHandoutOrder(LONG order) {
    Put(2016, VTS_I4, order);
}

void PrintOptions::PutFitToPage(LONG fit) {
    Put(2004, VTS_I4, fit);
}

void PrintOptions::PutPrintHiddenSlides(LONG print) {
    Put(2009, VTS_I4, print);
}

void PrintOptions::PutFrameSlides(LONG frame) {
    Put(2005, VTS_I4, frame);
}

void PrintOptions::PutPrintComments(LONG print) {
    Put(2017, VTS_I4, print);
}

PrintOptions Presentation::GetPrintOptions() {
    return GetObjectProperty<PrintOptions>(2033);
}

void Presentation::PrintOut(LONG from, LONG to, LPCTSTR printToFile, LONG copies, LONG collate) {
    Call(2034, VTS_I4 VTS_I4 VTS_BSTR VTS_I4 VTS_I4, from, to, printToFile, copies, collate);
}

void Presentation::Close() {
    Call(2039, VTS_NONE);
}

Presentation Presentations::Open(LPCTSTR fileName, LONG readOnly, LONG untitled, LONG withWindow) {
    return CallForObject<Presentation>(2004, VTS_BSTR VTS_I4 VTS_I4 VTS_I4, fileName, readOnly,
                                       untitled, withWindow);
}

Presentations Application::GetPresentations() {
    return GetObjectProperty<Presentations>(2001);
}

void Application::Quit() {
    Call(2021, VTS_NONE);
}

} // namespace powerpoint
