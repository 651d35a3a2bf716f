#pragma once

#include "standins/module/DocumentFile.h"
#include "standins/office/server/DocumentFormat.h"
#include "standins/process/Descriptor.h"

#include <list>
#include <memory>
#include <mutex>
#include <string>

namespace standins {

/// A PDF in a file that has no name any more: it goes with the last that holds it.
using Pdf = std::shared_ptr<const Descriptor>;

/// The PDFs of the documents that were loaded last, so that a document which was tried a moment
/// ago need not be loaded again. A document is known by its bytes, not by its name or time.
class PdfCache {
public:
    static PdfCache& Instance();

    /// @return null when the document is not known
    Pdf Find(const DocumentFile& document, const DocumentFormat& format);
    /// @param sha256 of the document, as the supervisor sent it
    void Add(const DocumentFile& document, const DocumentFormat& format, const std::string& sha256,
             const Pdf& pdf);
    bool IsEmpty();

private:
    struct Entry {
        std::uint64_t documentSize;
        std::string importFilter;
        std::string exportFilter;
        std::string sha256;
        Pdf pdf;
        std::uint64_t pdfSize;
    };

    bool MayKnow(const DocumentFile& document);
    void Shrink();

    std::mutex m_mutex;
    std::list<Entry> m_entries; ///< the one used last in front
};

} // namespace standins
