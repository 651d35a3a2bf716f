#include "standins/office/server/OpenedDocument.h"

#include "standins/module/Text.h"
#include "standins/office/server/Call.h"
#include "standins/office/server/DocumentLoader.h"

namespace standins {

OpenedDocument::OpenedDocument(const std::wstring& path, const std::vector<DocumentFormat>& formats)
    : m_name(FileName(path)), m_pages(LoadDocument(path, formats)) {}

const Pdf& OpenedDocument::Pages() const {
    if (!m_isOpen)
        throw Raised{m_name + L" is closed."};
    if (!m_pages)
        throw Raised{m_name + L" has no pages to print."};
    return m_pages;
}

void OpenedDocument::Close() {
    if (!m_isOpen)
        throw Raised{m_name + L" is closed."};
    m_isOpen = false;
    m_pages.reset();
}

} // namespace standins
