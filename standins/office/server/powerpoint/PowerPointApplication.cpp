#include "standins/office/server/powerpoint/PowerPointApplication.h"

#include "standins/office/server/Printers.h"
#include "standins/office/server/powerpoint/PowerPointPresentations.h"

namespace standins {

PowerPointApplication::PowerPointApplication()
    : AutomationObject(std::make_shared<Session>(L"PowerPoint", DefaultPrinter())) {}

const std::vector<Member>& PowerPointApplication::Members() const {
    static const std::vector<Member> members = {
        {2001, DISPATCH_PROPERTYGET, L"Presentations", 0, 0,
         Handle<&PowerPointApplication::Presentations>},
        {2021, DISPATCH_METHOD, L"Quit", 0, 0, Handle<&PowerPointApplication::Quit>},
    };
    return members;
}

void PowerPointApplication::Presentations(Call& call) {
    call.Return(MakeObject<PowerPointPresentations>(TheSession()));
}

void PowerPointApplication::Quit(Call& /*call*/) {
    TheSession()->isRunning = false;
}

} // namespace standins
