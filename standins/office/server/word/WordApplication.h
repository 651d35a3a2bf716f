#pragma once

#include "standins/office/server/AutomationObject.h"

namespace standins {

/// Word's Application object: one running Word.
class WordApplication : public AutomationObject {
public:
    WordApplication();

protected:
    const std::vector<Member>& Members() const override;

private:
    void Documents(Call& call);
    void Dialogs(Call& call);
    void ActivePrinter(Call& call);
    void PutActivePrinter(Call& call);
    void Quit(Call& call);
};

/// Makes a printer the session's active printer.
/// @throws Raised when there is no such printer
void SelectPrinter(Session& session, const std::wstring& name);

} // namespace standins
