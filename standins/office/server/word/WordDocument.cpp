#include "standins/office/server/word/WordDocument.h"

#include "standins/office/server/FilePrinter.h"
#include "standins/office/server/Printers.h"

namespace standins {

namespace {

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
        throw Raised{L"Printing is possible to a file only."};
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

} // namespace

const std::vector<Member>& WordDocument::Members() const {
    static const std::vector<Member> members = {
        {444, DISPATCH_METHOD, L"PrintOut", 0, 18, Handle<&WordDocument::PrintOut>},
        {1105, DISPATCH_METHOD, L"Close", 0, 3, Handle<&WordDocument::Close>},
    };
    return members;
}

void WordDocument::PrintOut(Call& call) {
    const Export& pages = m_document.Pages();
    RequirePrinter(TheSession()->printer);
    RefuseUnsupported(call);
    standins::PrintToFile({pages, m_document.Name(), call.Text(OutputFileName),
                           CheckCopies(call.Number(Copies, 1)), call.Flag(Collate, true)});
}

/// What is to be saved does not matter: documents are never changed.
void WordDocument::Close(Call& /*call*/) {
    m_document.Close();
}

} // namespace standins
