#include "standins/office/inprocess/OpenedDocument.h"

#include "standins/office/inprocess/Call.h"
#include "standins/office/inprocess/DocumentLoader.h"
#include "standins/shared/Text.h"

namespace standins {

OpenedDocument::OpenedDocument(const std::wstring& path, const std::vector<DocumentFormat>& formats)
    : m_name(FileName(path)), m_path(path), m_format(FormatOf(path, formats)),
      m_file(OpenDocument(path)), m_pages(LoadDocument(path, m_file, m_format)) {}

const Export& OpenedDocument::Pages() const {
    if (!m_isOpen)
        throw Raised{m_name + L" is closed."};
    if (!m_pages)
        throw Raised{m_name + L" has no pages to print."};
    return m_pages;
}

Export OpenedDocument::MadeAs(const std::string& exportTo) const {
    if (exportTo == m_format.exportTo)
        return Pages();
    Pages();
    DocumentFormat format = m_format;
    format.exportTo = exportTo;
    format.hiddenTo.clear();
    return LoadDocument(m_path, m_file, format);
}

void OpenedDocument::Close() {
    if (!m_isOpen)
        throw Raised{m_name + L" is closed."};
    m_isOpen = false;
    m_pages.reset();
    m_file = {};
}

} // namespace standins
