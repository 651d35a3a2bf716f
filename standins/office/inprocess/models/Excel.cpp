// Excel's object model.

#include "standins/office/inprocess/Applications.h"
#include "standins/office/inprocess/Printers.h"
#include "standins/office/inprocess/models/ObjectModel.h"

namespace standins {

namespace {

const std::vector<DocumentFormat> Formats = {
    {"xls", "MS Excel 97", "pdf:calc_pdf_Export"},
    {"xlsx", "Calc MS Excel 2007 XML", "pdf:calc_pdf_Export"},
};

/// The arguments of Open in order, as far as they have a bearing: workbooks are read only, never
/// updated from elsewhere, never listed.
enum OpenArgument : UINT {
    Format = 3,
    Password = 4,
    WriteResPassword = 5,
    Delimiter = 8,
    Converter = 11,
};

/// The arguments of PrintOut, in order.
enum PrintArgument : UINT {
    From,
    To,
    Copies,
    Preview,
    ActivePrinter,
    PrintToFile,
    Collate,
    PrToFileName,
};

/// Refuses what would have to be done otherwise than asked.
void RefuseUnsupported(const Call& call) {
    if (call.Has(From) || call.Has(To))
        throw Raised{L"A range of pages is not supported: a workbook is printed whole."};
    if (call.Flag(Preview, false))
        throw Raised{L"There is nobody to look at a preview."};
    if (!call.Flag(PrintToFile, false) || !call.Has(PrToFileName))
        RaiseNotToFile();
}

class ExcelWorkbook : public DocumentObject {
public:
    ExcelWorkbook(SharedSession session, OpenedDocument document)
        : DocumentObject(std::move(session), std::move(document),
                         {
                             Method<&ExcelWorkbook::Close>(277, L"Close", 0, 3),
                             Method<&ExcelWorkbook::PrintOut>(1772, L"PrintOut", 0, 8),
                         }) {}

private:
    /// Prints all sheets. The printer is the one that the call names, and from then on the active
    /// one.
    void PrintOut(Call& call) {
        const Export& pages = Document().Pages();
        RefuseUnsupported(call);
        std::wstring& printer = TheSession()->printer;
        const std::wstring wanted = call.Has(ActivePrinter) ? call.Text(ActivePrinter) : printer;
        RequirePrinter(wanted);
        printer = wanted;
        Print(call, printer, {PrToFileName, Copies, Collate}, pages);
    }
};

class ExcelWorkbooks : public AutomationObject {
public:
    explicit ExcelWorkbooks(SharedSession session)
        : AutomationObject(std::move(session),
                           {Method<&ExcelWorkbooks::Open>(682, L"Open", 1, 13)}) {}

private:
    void Open(Call& call) {
        if (call.Has(Password) || call.Has(WriteResPassword))
            throw Raised{L"Passwords are not supported."};
        if (call.Has(Format) || call.Has(Delimiter) || call.Has(Converter))
            throw Raised{L"The format of a workbook is told by its extension alone."};
        ReturnOpened<ExcelWorkbook>(call, TheSession(), Formats);
    }
};

class ExcelApplication : public ApplicationObject {
public:
    ExcelApplication()
        : ApplicationObject(L"Excel", {
                                          Get<&ExcelApplication::Workbooks>(572, L"Workbooks"),
                                          Method<&ExcelApplication::Quit>(302, L"Quit", 0, 0),
                                      }) {}

private:
    void Workbooks(Call& call) { call.Return(MakeObject<ExcelWorkbooks>(TheSession())); }
};

} // namespace

IDispatch* StartExcel() {
    return MakeObject<ExcelApplication>();
}

} // namespace standins
