#include "office/dispatch/WordObjects.h"

namespace word {

namespace {

constexpr LONG FilePrintSetup = 97; // wdDialogFilePrintSetup

constexpr char ThreeVariants[] = VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT;
constexpr char FourVariants[] = VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT;
constexpr char TwelveVariants[] = VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT
    VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT;
constexpr char EighteenVariants[] = VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT
    VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT
        VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT VTS_PVARIANT;

} // namespace

void Document::PrintOut(VARIANT* background, VARIANT* append, VARIANT* range,
                        VARIANT* outputFileName, VARIANT* from, VARIANT* to, VARIANT* item,
                        VARIANT* copies, VARIANT* pages, VARIANT* pageType, VARIANT* printToFile,
                        VARIANT* collate, VARIANT* activePrinterMacGX, VARIANT* manualDuplexPrint,
                        VARIANT* printZoomColumn, VARIANT* printZoomRow,
                        VARIANT* printZoomPaperWidth, VARIANT* printZoomPaperHeight) {
    Call(444, EighteenVariants, background, append, range, outputFileName, from, to, item, copies,
         pages, pageType, printToFile, collate, activePrinterMacGX, manualDuplexPrint,
         printZoomColumn, printZoomRow, printZoomPaperWidth, printZoomPaperHeight);
}

void Document::Close(VARIANT* saveChanges, VARIANT* originalFormat, VARIANT* routeDocument) {
    Call(1105, ThreeVariants, saveChanges, originalFormat, routeDocument);
}

Document Documents::Add(VARIANT* templateName, VARIANT* newTemplate, VARIANT* documentType,
                        VARIANT* visible) {
    return CallForObject<Document>(14, FourVariants, templateName, newTemplate, documentType,
                                   visible);
}

Document Documents::OpenReadOnly(VARIANT* fileName, VARIANT* readOnly, VARIANT* omitted) {
    VARIANT* confirmConversions = omitted;
    return CallForObject<Document>(15, TwelveVariants, fileName, confirmConversions, readOnly,
                                   omitted, omitted, omitted, omitted, omitted, omitted, omitted,
                                   omitted, omitted);
}

void PrintSetupDialog::PutPrinter(LPCTSTR name) {
    Put(1, VTS_BSTR, name);
}

void PrintSetupDialog::PutDoNotSetAsSysDefault(BOOL doNotSet) {
    Put(4, VTS_BOOL, doNotSet);
}

void PrintSetupDialog::Execute() {
    Call(32001, VTS_NONE);
}

PrintSetupDialog Dialogs::GetPrintSetup() {
    return CallForObject<PrintSetupDialog>(0, VTS_I4, FilePrintSetup);
}

Documents Application::GetDocuments() {
    return GetObjectProperty<Documents>(6);
}

Dialogs Application::GetDialogs() {
    return GetObjectProperty<Dialogs>(19);
}

void Application::PutActivePrinter(LPCTSTR name) {
    Put(66, VTS_BSTR, name);
}

void Application::Quit(VARIANT* saveChanges, VARIANT* originalFormat, VARIANT* routeDocument) {
    Call(1105, ThreeVariants, saveChanges, originalFormat, routeDocument);
}

} // namespace word
