#pragma once

#include "standins/office/server/AutomationObject.h"

namespace standins {

/// PowerPoint's Application object: one running PowerPoint.
class PowerPointApplication : public AutomationObject {
public:
    PowerPointApplication();

protected:
    const std::vector<Member>& Members() const override;

private:
    void Presentations(Call& call);
    void Quit(Call& call);
};

} // namespace standins
