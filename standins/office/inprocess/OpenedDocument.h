#pragma once

#include "standins/office/inprocess/DocumentFormat.h"
#include "standins/office/inprocess/ExportCache.h"

#include <string>
#include <vector>

namespace standins {

/// A document in an application, from its opening to its closing.
class OpenedDocument {
public:
    /// A new document, with nothing in it.
    OpenedDocument() = default;
    /// @throws Raised when it cannot be opened
    OpenedDocument(const std::wstring& path, const std::vector<DocumentFormat>& formats);

    /// The document's name, without its folder.
    const std::wstring& Name() const { return m_name; }

    /// @throws Raised when the document is closed, or has nothing in it
    const Export& Pages() const;

    /// The document made as something else than its pages; the engine may have to load it again.
    /// @param exportTo as in DocumentFormat
    /// @throws Raised when the document is closed, or that cannot be made
    Export MadeAs(const std::string& exportTo) const;

    /// @throws Raised when the document is closed already
    void Close();

private:
    std::wstring m_name = L"The new document";
    std::wstring m_path;
    DocumentFormat m_format{};
    DocumentFile m_file; ///< held, so that it is the same one as long as the document is open
    Export m_pages;
    bool m_isOpen = true;
};

} // namespace standins
