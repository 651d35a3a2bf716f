#pragma once

#include "standins/office/server/AutomationObject.h"
#include "standins/office/server/OpenedDocument.h"

namespace standins {

/// Excel's Workbook object.
class ExcelWorkbook : public AutomationObject {
public:
    ExcelWorkbook(SharedSession session, OpenedDocument document)
        : AutomationObject(std::move(session)), m_document(std::move(document)) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void Close(Call& call);
    void PrintOut(Call& call);

    OpenedDocument m_document;
};

} // namespace standins
