// Publisher's object model.

#include "standins/office/inprocess/Applications.h"
#include "standins/office/inprocess/Printers.h"
#include "standins/office/inprocess/models/ObjectModel.h"

namespace standins {

namespace {

const std::vector<DocumentFormat> Formats = {
    {"pub", "Publisher 98-2010", "pdf:draw_pdf_Export"},
};

/// A publication.
class PublisherDocument : public DocumentObject {
public:
    PublisherDocument(const SharedSession& session, OpenedDocument document)
        : DocumentObject(session, std::move(document),
                         {
                             Put<&PublisherDocument::PutActivePrinter>(1, L"ActivePrinter"),
                             Method<&PublisherDocument::Close>(48, L"Close", 0, 0),
                             Method<&PublisherDocument::PrintOut>(54, L"PrintOut", 0, 5),
                         }),
          m_printer(session->printer) {}

private:
    void PutActivePrinter(Call& call) {
        const std::wstring printer = call.Text(0);
        RequirePrinter(printer);
        m_printer = printer;
    }

    void PrintOut(Call& call) {
        const Export& pages = Document().Pages();
        RequireWholeToFile(call,
                           L"A range of pages is not supported: a publication is printed whole.");
        RequirePrinter(m_printer);
        Print(call, m_printer, AfterRange, pages);
    }

    std::wstring m_printer;
};

class PublisherApplication : public ApplicationObject {
public:
    PublisherApplication()
        : ApplicationObject(L"Publisher",
                            {
                                Method<&PublisherApplication::Open>(38, L"Open", 1, 4),
                                Method<&PublisherApplication::Quit>(39, L"Quit", 0, 0),
                            }) {}

private:
    /// The other arguments have no bearing: nothing is changed or listed.
    void Open(Call& call) { ReturnOpened<PublisherDocument>(call, TheSession(), Formats); }
};

} // namespace

IDispatch* StartPublisher() {
    return MakeObject<PublisherApplication>();
}

} // namespace standins
