#pragma once

#include "standins/office/server/AutomationObject.h"

namespace standins {

/// Word's Documents collection.
class WordDocuments : public AutomationObject {
public:
    explicit WordDocuments(SharedSession session) : AutomationObject(std::move(session)) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void Add(Call& call);
    void Open(Call& call);
};

} // namespace standins
