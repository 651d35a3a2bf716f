#pragma once

#include <com/sun/star/lang/XComponent.hpp>
#include <string>

namespace standins {

/// A document in LibreOffice, loaded as when a command line asks to convert it: hidden, read-only,
/// without questions. What fails is told on standard error, in LibreOffice's own words there.
class LoadedDocument {
public:
    /// @param path full path
    /// @param importFilter LibreOffice's name of the document's type
    LoadedDocument(const std::string& path, const std::string& importFilter);

    bool IsLoaded() const { return m_document.is(); }
    /// Whether it is a presentation, and slides of it are not shown.
    bool HasHiddenSlides() const;
    /// Makes something else of it.
    /// @param exportTo extension, colon, LibreOffice's filter with options if any
    void Export(const std::string& exportTo, const std::string& path) const;

private:
    css::uno::Reference<css::lang::XComponent> m_document;
};

} // namespace standins
