#pragma once

#include "office/dispatch/DispatchWrapper.h"

// PowerPoint's objects. Yes and no are the numbers 1 and 0.

namespace powerpoint {

/// How a presentation is printed; the values belong to the presentation and go with it.
class PrintOptions : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    void PutActivePrinter(LPCTSTR name);
    void PutPrintColorType(LONG type);
    void PutPrintInBackground(LONG inBackground);
    void PutOutputType(LONG type);
    void PutHandoutOrder(LONG order);
    void PutFitToPage(LONG fit);
    void PutPrintHiddenSlides(LONG print);
    void PutFrameSlides(LONG frame);
    void PutPrintComments(LONG print);
};

class Presentation : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    PrintOptions GetPrintOptions();
    void PrintOut(LONG from, LONG to, LPCTSTR printToFile, LONG copies, LONG collate);
    void Close();
};

class Presentations : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    Presentation Open(LPCTSTR fileName, LONG readOnly, LONG untitled, LONG withWindow);
};

class Application : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    Presentations GetPresentations();
    void Quit();
};

} // namespace powerpoint
