#pragma once

#include "standins/office/server/AutomationObject.h"
#include "standins/office/server/OpenedDocument.h"

namespace standins {

/// Word's Document object.
class WordDocument : public AutomationObject {
public:
    WordDocument(SharedSession session, OpenedDocument document)
        : AutomationObject(std::move(session)), m_document(std::move(document)) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void PrintOut(Call& call);
    void Close(Call& call);

    OpenedDocument m_document;
};

} // namespace standins
