#include "standins/office/inprocess/ExportCache.h"

#include "standins/shared/FileBytes.h"

#include <sys/stat.h>

#include <algorithm>

namespace standins {

namespace {

// A folder full of documents may be tried before the first is printed.
constexpr std::size_t MostEntries = 100; // each holds a descriptor
constexpr std::uint64_t MostBytes = std::uint64_t{256} << 20;

std::uint64_t SizeOf(const Descriptor& file) {
    struct stat status {};
    return fstat(file.Get(), &status) == 0 ? static_cast<std::uint64_t>(status.st_size) : 0;
}

/// @return empty when the document cannot be read
std::string SumOf(const DocumentFile& document) {
    Sha256 sum;
    const int error =
        ReadWhole(document.descriptor.Get(), [&](const char* bytes, std::size_t size) {
            sum.Add(bytes, size);
            return 0;
        });
    return error == 0 ? sum.Text() : std::string();
}

} // namespace

ExportCache& ExportCache::Instance() {
    static ExportCache cache;
    return cache;
}

Export ExportCache::Find(const std::wstring& path, const DocumentFile& document,
                         const DocumentFormat& format) {
    if (!MayKnow(document))
        return nullptr;
    const std::string sum = SumOf(document);
    const std::lock_guard lock(m_mutex);
    for (auto entry = m_entries.begin(); entry != m_entries.end(); ++entry) {
        if (entry->sha256 == sum && entry->path == path &&
            entry->importFilter == format.importFilter && entry->exportTo == format.exportTo) {
            m_entries.splice(m_entries.begin(), m_entries, entry);
            return entry->output;
        }
    }
    return nullptr;
}

void ExportCache::Add(const std::wstring& path, const DocumentFile& document,
                      const DocumentFormat& format, const std::string& sha256,
                      const Export& output) {
    const std::lock_guard lock(m_mutex);
    m_entries.push_front({path, document.size, format.importFilter, format.exportTo, sha256, output,
                          SizeOf(output->file)});
    Shrink();
}

bool ExportCache::IsEmpty() {
    const std::lock_guard lock(m_mutex);
    return m_entries.empty();
}

/// Spares the reading of a document that is not known for sure.
bool ExportCache::MayKnow(const DocumentFile& document) {
    const std::lock_guard lock(m_mutex);
    return std::any_of(m_entries.begin(), m_entries.end(),
                       [&](const Entry& entry) { return entry.documentSize == document.size; });
}

void ExportCache::Shrink() {
    std::uint64_t bytes = 0;
    std::size_t kept = 0;
    auto entry = m_entries.begin();
    for (; entry != m_entries.end() && kept < MostEntries; ++entry, ++kept) {
        bytes += entry->exportSize;
        if (bytes > MostBytes)
            break;
    }
    m_entries.erase(entry, m_entries.end());
}

} // namespace standins
