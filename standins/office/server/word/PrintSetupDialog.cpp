#include "standins/office/server/word/PrintSetupDialog.h"

#include "standins/office/server/word/WordApplication.h"

namespace standins {

const std::vector<Member>& PrintSetupDialog::Members() const {
    static const std::vector<Member> members = {
        {1, DISPATCH_PROPERTYGET, L"Printer", 0, 0, Handle<&PrintSetupDialog::Printer>},
        {1, DISPATCH_PROPERTYPUT, L"Printer", 1, 1, Handle<&PrintSetupDialog::PutPrinter>},
        {4, DISPATCH_PROPERTYPUT, L"DoNotSetAsSysDefault", 1, 1,
         Handle<&PrintSetupDialog::PutDoNotSetAsSysDefault>},
        {32001, DISPATCH_METHOD, L"Execute", 0, 0, Handle<&PrintSetupDialog::Execute>},
    };
    return members;
}

void PrintSetupDialog::Printer(Call& call) {
    call.Return(m_printer);
}

void PrintSetupDialog::PutPrinter(Call& call) {
    m_printer = call.Text(0);
}

void PrintSetupDialog::PutDoNotSetAsSysDefault(Call& call) {
    m_isForWordAlone = call.Flag(0);
}

void PrintSetupDialog::Execute(Call& /*call*/) {
    if (!m_isForWordAlone)
        throw Raised{L"The system's default printer cannot be changed: set DoNotSetAsSysDefault."};
    SelectPrinter(*TheSession(), m_printer);
}

} // namespace standins
