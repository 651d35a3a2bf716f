#include "standins/office/server/publisher/PublisherApplication.h"

#include "standins/office/server/Printers.h"
#include "standins/office/server/publisher/PublisherDocument.h"

namespace standins {

namespace {

const std::vector<DocumentFormat> Formats = {
    {"pub", "Publisher 98-2010", "pdf:draw_pdf_Export"},
};

constexpr UINT OpenFileName = 0; // the others have no bearing: nothing is changed or listed

} // namespace

PublisherApplication::PublisherApplication()
    : AutomationObject(std::make_shared<Session>(L"Publisher", DefaultPrinter())) {}

const std::vector<Member>& PublisherApplication::Members() const {
    static const std::vector<Member> members = {
        {38, DISPATCH_METHOD, L"Open", 1, 4, Handle<&PublisherApplication::Open>},
        {39, DISPATCH_METHOD, L"Quit", 0, 0, Handle<&PublisherApplication::Quit>},
    };
    return members;
}

void PublisherApplication::Open(Call& call) {
    call.Return(MakeObject<PublisherDocument>(TheSession(),
                                              OpenedDocument(call.Text(OpenFileName), Formats)));
}

void PublisherApplication::Quit(Call& /*call*/) {
    TheSession()->isRunning = false;
}

} // namespace standins
