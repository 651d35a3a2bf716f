#include "standins/office/server/powerpoint/PowerPointPresentation.h"

namespace standins {

const std::vector<Member>& PowerPointPresentation::Members() const {
    static const std::vector<Member> members = {
        {2039, DISPATCH_METHOD, L"Close", 0, 0, Handle<&PowerPointPresentation::Close>},
    };
    return members;
}

/// What is to be saved does not matter: documents are never changed.
void PowerPointPresentation::Close(Call& /*call*/) {
    m_document.Close();
}

} // namespace standins
