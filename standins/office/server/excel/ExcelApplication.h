#pragma once

#include "standins/office/server/AutomationObject.h"

namespace standins {

/// Excel's Application object: one running Excel.
class ExcelApplication : public AutomationObject {
public:
    ExcelApplication();

protected:
    const std::vector<Member>& Members() const override;

private:
    void Workbooks(Call& call);
    void Quit(Call& call);
};

} // namespace standins
