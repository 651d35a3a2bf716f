#pragma once

#include "standins/office/server/AutomationObject.h"

namespace standins {

/// PowerPoint's Presentations collection.
class PowerPointPresentations : public AutomationObject {
public:
    explicit PowerPointPresentations(SharedSession session)
        : AutomationObject(std::move(session)) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void Open(Call& call);
};

} // namespace standins
