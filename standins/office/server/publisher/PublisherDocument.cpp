#include "standins/office/server/publisher/PublisherDocument.h"

#include "standins/office/server/FilePrinter.h"
#include "standins/office/server/Printers.h"

namespace standins {

namespace {

/// The arguments of PrintOut, in order.
enum PrintArgument : UINT { From, To, PrintToFileName, Copies, Collate };

constexpr LONG Whole = -1; // from the first page, to the last one

} // namespace

const std::vector<Member>& PublisherDocument::Members() const {
    static const std::vector<Member> members = {
        {1, DISPATCH_PROPERTYPUT, L"ActivePrinter", 1, 1,
         Handle<&PublisherDocument::PutActivePrinter>},
        {48, DISPATCH_METHOD, L"Close", 0, 0, Handle<&PublisherDocument::Close>},
        {54, DISPATCH_METHOD, L"PrintOut", 0, 5, Handle<&PublisherDocument::PrintOut>},
    };
    return members;
}

void PublisherDocument::PutActivePrinter(Call& call) {
    const std::wstring printer = call.Text(0);
    RequirePrinter(printer);
    m_printer = printer;
}

/// What is to be saved does not matter: publications are never changed.
void PublisherDocument::Close(Call& /*call*/) {
    m_document.Close();
}

void PublisherDocument::PrintOut(Call& call) {
    const Export& pages = m_document.Pages();
    if (call.Number(From, Whole) != Whole || call.Number(To, Whole) != Whole)
        throw Raised{L"A range of pages is not supported: a publication is printed whole."};
    if (!call.Has(PrintToFileName))
        throw Raised{L"Printing is possible to a file only."};
    RequirePrinter(m_printer);
    PrintToFile({pages, m_document.Name(), call.Text(PrintToFileName),
                 CheckCopies(call.Number(Copies, 1)), call.Flag(Collate, true)});
}

} // namespace standins
