#pragma once

#include "standins/office/server/AutomationObject.h"
#include "standins/office/server/OpenedDocument.h"

namespace standins {

/// PowerPoint's Presentation object.
class PowerPointPresentation : public AutomationObject {
public:
    PowerPointPresentation(SharedSession session, OpenedDocument document)
        : AutomationObject(std::move(session)), m_document(std::move(document)) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void Close(Call& call);

    OpenedDocument m_document;
};

} // namespace standins
