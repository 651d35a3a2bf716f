#pragma once

#include "office/dispatch/DispatchWrapper.h"

// Word's objects. Optional arguments are passed as pointers to variants, as Word's type library has
// them; the variants stay the caller's.

namespace word {

class Document : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    void PrintOut(VARIANT* background, VARIANT* append, VARIANT* range, VARIANT* outputFileName,
                  VARIANT* from, VARIANT* to, VARIANT* item, VARIANT* copies, VARIANT* pages,
                  VARIANT* pageType, VARIANT* printToFile, VARIANT* collate,
                  VARIANT* activePrinterMacGX, VARIANT* manualDuplexPrint, VARIANT* printZoomColumn,
                  VARIANT* printZoomRow, VARIANT* printZoomPaperWidth,
                  VARIANT* printZoomPaperHeight);
    void Close(VARIANT* saveChanges, VARIANT* originalFormat, VARIANT* routeDocument);
};

class Documents : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    Document Add(VARIANT* templateName, VARIANT* newTemplate, VARIANT* documentType,
                 VARIANT* visible);

    /// Documents.Open with the arguments after the third all omitted.
    /// @param omitted serves for each of them
    Document OpenReadOnly(VARIANT* fileName, VARIANT* readOnly, VARIANT* omitted);
};

/// Word's print set-up dialogue. Its settings are no members of the type library: they are reached
/// by their place in the dialogue's argument list.
class PrintSetupDialog : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    void PutPrinter(LPCTSTR name);
    void PutDoNotSetAsSysDefault(BOOL doNotSet);
    void Execute();
};

class Dialogs : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    PrintSetupDialog GetPrintSetup();
};

class Application : public DispatchWrapper {
public:
    using DispatchWrapper::DispatchWrapper;

    Documents GetDocuments();
    Dialogs GetDialogs();
    void PutActivePrinter(LPCTSTR name);
    void Quit(VARIANT* saveChanges, VARIANT* originalFormat, VARIANT* routeDocument);
};

} // namespace word
