#pragma once

#include "standins/office/server/AutomationObject.h"
#include "standins/office/server/OpenedDocument.h"

namespace standins {

/// Publisher's Document object, a publication.
class PublisherDocument : public AutomationObject {
public:
    PublisherDocument(SharedSession session, OpenedDocument document)
        : AutomationObject(std::move(session)), m_document(std::move(document)),
          m_printer(TheSession()->printer) {}

protected:
    const std::vector<Member>& Members() const override;

private:
    void PutActivePrinter(Call& call);
    void Close(Call& call);
    void PrintOut(Call& call);

    OpenedDocument m_document;
    std::wstring m_printer;
};

} // namespace standins
