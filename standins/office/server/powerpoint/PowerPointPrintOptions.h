#pragma once

#include "standins/office/server/AutomationObject.h"
#include "standins/office/server/powerpoint/PresentationPrint.h"

namespace standins {

/// PowerPoint's PrintOptions object of one presentation.
class PowerPointPrintOptions : public AutomationObject {
public:
    PowerPointPrintOptions(SharedSession session, SharedPresentationPrint print)
        : AutomationObject(std::move(session)), m_print(std::move(print)) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void PutPrintColorType(Call& call);
    void PutFitToPage(Call& call);
    void PutFrameSlides(Call& call);
    void PutOutputType(Call& call);
    void PutPrintHiddenSlides(Call& call);
    void PutPrintInBackground(Call& call);
    void PutActivePrinter(Call& call);
    void PutHandoutOrder(Call& call);
    void PutPrintComments(Call& call);

    SharedPresentationPrint m_print;
};

} // namespace standins
