#pragma once

#include "standins/office/server/AutomationObject.h"

namespace standins {

/// Publisher's Application object: one running Publisher.
class PublisherApplication : public AutomationObject {
public:
    PublisherApplication();

protected:
    const std::vector<Member>& Members() const override;

private:
    void Open(Call& call);
    void Quit(Call& call);
};

} // namespace standins
