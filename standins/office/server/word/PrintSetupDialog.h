#pragma once

#include "standins/office/server/AutomationObject.h"

namespace standins {

/// Word's dialog for the choice of a printer, never shown. Its arguments have no names in Word's
/// type library; they are reached by their positions.
class PrintSetupDialog : public AutomationObject {
public:
    explicit PrintSetupDialog(const SharedSession& session)
        : AutomationObject(session), m_printer(session->printer) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void Printer(Call& call);
    void PutPrinter(Call& call);
    void PutDoNotSetAsSysDefault(Call& call);
    void Execute(Call& call);

    std::wstring m_printer;
    bool m_isForWordAlone = false;
};

} // namespace standins
