// Word's object model.

#include "standins/office/inprocess/Applications.h"
#include "standins/office/inprocess/Printers.h"
#include "standins/office/inprocess/models/ObjectModel.h"

namespace standins {

namespace {

const std::vector<DocumentFormat> Formats = {
    {"doc", "MS Word 97", "pdf:writer_pdf_Export"},
    {"docx", "MS Word 2007 XML", "pdf:writer_pdf_Export"},
};

/// The arguments of Open, as far as they have a bearing: documents are read only, never listed,
/// never shown.
enum OpenArgument : UINT {
    PasswordDocument = 4,
    PasswordTemplate = 5,
    Format = 9,
    Encoding = 10,
};

/// The arguments of PrintOut, in order.
enum PrintArgument : UINT {
    Background, // the print is done when the call returns, which suits either wish
    Append,
    Range,
    OutputFileName,
    From,
    To,
    Item,
    Copies,
    Pages,
    PageType,
    PrintToFile,
    Collate,
    ActivePrinterMacGX,
    ManualDuplexPrint,
    PrintZoomColumn,
    PrintZoomRow,
    PrintZoomPaperWidth,
    PrintZoomPaperHeight,
};

[[noreturn]] void RaiseUnsupported(const wchar_t* what) {
    throw Raised{std::wstring(what) + L" is not supported: a document is printed whole, page by "
                                      L"page, into a file of its own."};
}

/// Refuses what would have to be done otherwise than asked.
void RefuseUnsupported(const Call& call) {
    constexpr LONG Everything = 0; // the whole document, its content, all its pages
    if (!call.Flag(PrintToFile, false) || !call.Has(OutputFileName))
        RaiseNotToFile();
    if (call.Flag(Append, false))
        RaiseUnsupported(L"Appending to a file");
    if (call.Number(Range, Everything) != Everything || call.Has(From) || call.Has(To) ||
        call.Has(Pages))
        RaiseUnsupported(L"A range of pages");
    if (call.Number(Item, Everything) != Everything ||
        call.Number(PageType, Everything) != Everything)
        RaiseUnsupported(L"A part of the document");
    if (call.Flag(ManualDuplexPrint, false))
        RaiseUnsupported(L"Printing on both sides by hand");
    for (const UINT zoom :
         {PrintZoomColumn, PrintZoomRow, PrintZoomPaperWidth, PrintZoomPaperHeight}) {
        if (call.Number(zoom, 0) != 0)
            RaiseUnsupported(L"Zooming");
    }
}

/// @throws Raised when there is no such printer
void SelectPrinter(Session& session, const std::wstring& name) {
    RequirePrinter(name);
    session.printer = name;
}

class WordDocument : public DocumentObject {
public:
    WordDocument(SharedSession session, OpenedDocument document)
        : DocumentObject(std::move(session), std::move(document),
                         {
                             Method<&WordDocument::PrintOut>(444, L"PrintOut", 0, 18),
                             Method<&WordDocument::Close>(1105, L"Close", 0, 3),
                         }) {}

private:
    void PrintOut(Call& call) {
        const Export& pages = Document().Pages();
        RequirePrinter(TheSession()->printer);
        RefuseUnsupported(call);
        Print(call, TheSession()->printer, {OutputFileName, Copies, Collate}, pages);
    }
};

class WordDocuments : public AutomationObject {
public:
    explicit WordDocuments(SharedSession session)
        : AutomationObject(std::move(session), {
                                                   Method<&WordDocuments::Add>(14, L"Add", 0, 4),
                                                   Method<&WordDocuments::Open>(15, L"Open", 1, 12),
                                               }) {}

private:
    void Add(Call& call) {
        constexpr UINT Template = 0;
        if (call.Has(Template))
            throw Raised{L"Templates are not supported."};
        call.Return(MakeObject<WordDocument>(TheSession(), OpenedDocument()));
    }

    void Open(Call& call) {
        if (call.Has(PasswordDocument) || call.Has(PasswordTemplate))
            throw Raised{L"Passwords are not supported."};
        constexpr LONG Automatic = 0;
        if (call.Number(Format, Automatic) != Automatic || call.Has(Encoding))
            throw Raised{L"The format of a document is told by its extension alone."};
        ReturnOpened<WordDocument>(call, TheSession(), Formats);
    }
};

/// The dialog for the choice of a printer, never shown. Its arguments have no names in Word's type
/// library; they are reached by their positions.
class PrintSetupDialog : public AutomationObject {
public:
    explicit PrintSetupDialog(const SharedSession& session)
        : AutomationObject(
              session,
              {
                  Get<&PrintSetupDialog::Printer>(1, L"Printer"),
                  Put<&PrintSetupDialog::PutPrinter>(1, L"Printer"),
                  Put<&PrintSetupDialog::PutDoNotSetAsSysDefault>(4, L"DoNotSetAsSysDefault"),
                  Method<&PrintSetupDialog::Execute>(32001, L"Execute", 0, 0),
              }),
          m_printer(session->printer) {}

private:
    void Printer(Call& call) { call.Return(m_printer); }
    void PutPrinter(Call& call) { m_printer = call.Text(0); }
    void PutDoNotSetAsSysDefault(Call& call) { m_isForWordAlone = call.Flag(0); }

    void Execute(Call& /*call*/) {
        if (!m_isForWordAlone)
            throw Raised{
                L"The system's default printer cannot be changed: set DoNotSetAsSysDefault."};
        SelectPrinter(*TheSession(), m_printer);
    }

    std::wstring m_printer;
    bool m_isForWordAlone = false;
};

/// The collection of dialogs: that for the print setup is in it.
class WordDialogs : public AutomationObject {
public:
    explicit WordDialogs(SharedSession session)
        : AutomationObject(std::move(session),
                           {Method<&WordDialogs::Item>(DISPID_VALUE, L"Item", 1, 1)}) {}

private:
    void Item(Call& call) {
        constexpr LONG FilePrintSetup = 97; // wdDialogFilePrintSetup
        const LONG index = call.Number(0);
        if (index != FilePrintSetup)
            throw Raised{L"There is no dialog number " + std::to_wstring(index) + L"."};
        call.Return(MakeObject<PrintSetupDialog>(TheSession()));
    }
};

class WordApplication : public ApplicationObject {
public:
    WordApplication()
        : ApplicationObject(L"Word",
                            {
                                Get<&WordApplication::Documents>(6, L"Documents"),
                                Get<&WordApplication::Dialogs>(19, L"Dialogs"),
                                Get<&WordApplication::ActivePrinter>(66, L"ActivePrinter"),
                                Put<&WordApplication::PutActivePrinter>(66, L"ActivePrinter"),
                                Method<&WordApplication::Quit>(1105, L"Quit", 0, 3),
                            }) {}

private:
    void Documents(Call& call) { call.Return(MakeObject<WordDocuments>(TheSession())); }
    void Dialogs(Call& call) { call.Return(MakeObject<WordDialogs>(TheSession())); }
    void ActivePrinter(Call& call) { call.Return(TheSession()->printer); }
    void PutActivePrinter(Call& call) { SelectPrinter(*TheSession(), call.Text(0)); }
};

} // namespace

IDispatch* StartWord() {
    return MakeObject<WordApplication>();
}

} // namespace standins
