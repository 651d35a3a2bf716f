#pragma once

#include <string>
#include <vector>

namespace standins {

/// A kind of document that an application opens, and LibreOffice's names for it.
struct DocumentFormat {
    const char* extension; ///< in lower case, without a dot
    /// Said to LibreOffice, it takes nothing else under this extension; left to itself, it would
    /// import anything at all as text.
    const char* importFilter;
    std::string exportTo;   ///< what its pages are made as: LibreOffice's "pdf:" and a filter
    std::string hiddenTo{}; ///< the same with hidden slides; empty for what has none
};

/// @return the format of the document at `path` by its extension in any case; null when it is none
/// of these
const DocumentFormat* FindFormat(const std::vector<DocumentFormat>& formats,
                                 const std::wstring& path);

} // namespace standins
