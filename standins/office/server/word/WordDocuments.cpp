#include "standins/office/server/word/WordDocuments.h"

#include "standins/office/server/word/WordDocument.h"

namespace standins {

namespace {

const std::vector<DocumentFormat> Formats = {
    {"doc", "MS Word 97", "pdf:writer_pdf_Export"},
    {"docx", "MS Word 2007 XML", "pdf:writer_pdf_Export"},
};

// Arguments of Open. Those that are not named have no bearing: documents are read only, never
// listed, never shown.
constexpr UINT OpenFileName = 0;
constexpr UINT OpenPasswordDocument = 4;
constexpr UINT OpenPasswordTemplate = 5;
constexpr UINT OpenFormat = 9;
constexpr UINT OpenEncoding = 10;

} // namespace

const std::vector<Member>& WordDocuments::Members() const {
    static const std::vector<Member> members = {
        {14, DISPATCH_METHOD, L"Add", 0, 4, Handle<&WordDocuments::Add>},
        {15, DISPATCH_METHOD, L"Open", 1, 12, Handle<&WordDocuments::Open>},
    };
    return members;
}

void WordDocuments::Add(Call& call) {
    constexpr UINT Template = 0;
    if (call.Has(Template))
        throw Raised{L"Templates are not supported."};
    call.Return(MakeObject<WordDocument>(TheSession(), OpenedDocument()));
}

void WordDocuments::Open(Call& call) {
    if (call.Has(OpenPasswordDocument) || call.Has(OpenPasswordTemplate))
        throw Raised{L"Passwords are not supported."};
    constexpr LONG Automatic = 0;
    if (call.Number(OpenFormat, Automatic) != Automatic || call.Has(OpenEncoding))
        throw Raised{L"The format of a document is told by its extension alone."};
    call.Return(
        MakeObject<WordDocument>(TheSession(), OpenedDocument(call.Text(OpenFileName), Formats)));
}

} // namespace standins
