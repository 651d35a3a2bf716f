#include "standins/office/server/excel/ExcelApplication.h"

#include "standins/office/server/Printers.h"
#include "standins/office/server/excel/ExcelWorkbooks.h"

namespace standins {

ExcelApplication::ExcelApplication()
    : AutomationObject(std::make_shared<Session>(L"Excel", DefaultPrinter())) {}

const std::vector<Member>& ExcelApplication::Members() const {
    static const std::vector<Member> members = {
        {572, DISPATCH_PROPERTYGET, L"Workbooks", 0, 0, Handle<&ExcelApplication::Workbooks>},
        {302, DISPATCH_METHOD, L"Quit", 0, 0, Handle<&ExcelApplication::Quit>},
    };
    return members;
}

void ExcelApplication::Workbooks(Call& call) {
    call.Return(MakeObject<ExcelWorkbooks>(TheSession()));
}

void ExcelApplication::Quit(Call& /*call*/) {
    TheSession()->isRunning = false;
}

} // namespace standins
