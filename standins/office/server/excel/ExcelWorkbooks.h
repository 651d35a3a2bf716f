#pragma once

#include "standins/office/server/AutomationObject.h"

namespace standins {

/// Excel's Workbooks collection.
class ExcelWorkbooks : public AutomationObject {
public:
    explicit ExcelWorkbooks(SharedSession session) : AutomationObject(std::move(session)) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void Open(Call& call);
};

} // namespace standins
