#pragma once

#include "standins/office/server/AutomationObject.h"

namespace standins {

/// Word's Dialogs collection: the print setup dialog is in it.
class WordDialogs : public AutomationObject {
public:
    explicit WordDialogs(SharedSession session) : AutomationObject(std::move(session)) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void Item(Call& call);
};

} // namespace standins
