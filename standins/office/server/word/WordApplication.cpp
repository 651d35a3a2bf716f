#include "standins/office/server/word/WordApplication.h"

#include "standins/office/server/Printers.h"
#include "standins/office/server/word/WordDialogs.h"
#include "standins/office/server/word/WordDocuments.h"

namespace standins {

WordApplication::WordApplication()
    : AutomationObject(std::make_shared<Session>(L"Word", DefaultPrinter())) {}

const std::vector<Member>& WordApplication::Members() const {
    static const std::vector<Member> members = {
        {6, DISPATCH_PROPERTYGET, L"Documents", 0, 0, Handle<&WordApplication::Documents>},
        {19, DISPATCH_PROPERTYGET, L"Dialogs", 0, 0, Handle<&WordApplication::Dialogs>},
        {66, DISPATCH_PROPERTYGET, L"ActivePrinter", 0, 0, Handle<&WordApplication::ActivePrinter>},
        {66, DISPATCH_PROPERTYPUT, L"ActivePrinter", 1, 1,
         Handle<&WordApplication::PutActivePrinter>},
        {1105, DISPATCH_METHOD, L"Quit", 0, 3, Handle<&WordApplication::Quit>},
    };
    return members;
}

void WordApplication::Documents(Call& call) {
    call.Return(MakeObject<WordDocuments>(TheSession()));
}

void WordApplication::Dialogs(Call& call) {
    call.Return(MakeObject<WordDialogs>(TheSession()));
}

void WordApplication::ActivePrinter(Call& call) {
    call.Return(TheSession()->printer);
}

void WordApplication::PutActivePrinter(Call& call) {
    SelectPrinter(*TheSession(), call.Text(0));
}

/// What is to be saved does not matter: documents are never changed.
void WordApplication::Quit(Call& /*call*/) {
    TheSession()->isRunning = false;
}

void SelectPrinter(Session& session, const std::wstring& name) {
    RequirePrinter(name);
    session.printer = name;
}

} // namespace standins
