#pragma once

#include "standins/inprocess/DocumentFile.h"
#include "standins/office/inprocess/DocumentFormat.h"
#include "standins/shared/Descriptor.h"

#include <list>
#include <memory>
#include <mutex>
#include <string>

namespace standins {

/// What LibreOffice made of a document.
struct MadeFile {
    Descriptor file;   ///< as a rule a PDF; it has no name any more and goes with this
    std::string fonts; ///< those that others stood in for, as LeaveFonts takes them
};

/// Goes with the last that holds it.
using Export = std::shared_ptr<const MadeFile>;

/// What was made of the documents that were loaded last, so that a document which was tried a
/// moment ago need not be loaded again. A document is known by its bytes, and its path, which may
/// be printed in it.
class ExportCache {
public:
    static ExportCache& Instance();

    /// @return null when the document is not known
    Export Find(const std::wstring& path, const DocumentFile& document,
                const DocumentFormat& format);
    /// @param sha256 of the document, as the supervisor sent it
    void Add(const std::wstring& path, const DocumentFile& document, const DocumentFormat& format,
             const std::string& sha256, const Export& output);
    bool IsEmpty();

private:
    struct Entry {
        std::wstring path;
        std::uint64_t documentSize;
        std::string importFilter;
        std::string exportTo;
        std::string sha256;
        Export output;
        std::uint64_t exportSize;
    };

    bool MayKnow(const DocumentFile& document);
    void Shrink();

    std::mutex m_mutex;
    std::list<Entry> m_entries; ///< the one used last in front
};

} // namespace standins
