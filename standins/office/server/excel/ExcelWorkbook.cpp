#include "standins/office/server/excel/ExcelWorkbook.h"

#include "standins/office/server/FilePrinter.h"
#include "standins/office/server/Printers.h"

namespace standins {

namespace {

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
        throw Raised{L"Printing is possible to a file only."};
}

} // namespace

const std::vector<Member>& ExcelWorkbook::Members() const {
    static const std::vector<Member> members = {
        {277, DISPATCH_METHOD, L"Close", 0, 3, Handle<&ExcelWorkbook::Close>},
        {1772, DISPATCH_METHOD, L"PrintOut", 0, 8, Handle<&ExcelWorkbook::PrintOut>},
    };
    return members;
}

/// What is to be saved does not matter: documents are never changed.
void ExcelWorkbook::Close(Call& /*call*/) {
    m_document.Close();
}

/// Prints all sheets. The printer is the one that the call names, and from then on the active one.
void ExcelWorkbook::PrintOut(Call& call) {
    const Export& pages = m_document.Pages();
    RefuseUnsupported(call);
    std::wstring& printer = TheSession()->printer;
    const std::wstring wanted = call.Has(ActivePrinter) ? call.Text(ActivePrinter) : printer;
    RequirePrinter(wanted);
    printer = wanted;
    standins::PrintToFile({pages, m_document.Name(), call.Text(PrToFileName),
                           CheckCopies(call.Number(Copies, 1)), call.Flag(Collate, true)});
}

} // namespace standins
