#pragma once

#include "standins/office/server/AutomationObject.h"
#include "standins/office/server/OpenedDocument.h"
#include "standins/office/server/powerpoint/PresentationPrint.h"

namespace standins {

/// PowerPoint's Presentation object.
class PowerPointPresentation : public AutomationObject {
public:
    PowerPointPresentation(SharedSession session, OpenedDocument document);

protected:
    const std::vector<Member>& Members() const override;

private:
    void PrintOptions(Call& call);
    void PrintOut(Call& call);
    void Close(Call& call);

    OpenedDocument m_document;
    SharedPresentationPrint m_print;
};

} // namespace standins
