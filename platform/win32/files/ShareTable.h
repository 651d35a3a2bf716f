#pragma once

#include <windef.h>

#include <sys/types.h>

#include <map>
#include <mutex>
#include <utility>

namespace win32 {

/// A file, whatever the name it was opened by.
using FileId = std::pair<dev_t, ino_t>;

/// What a handle does with its file, and what it lets others do meanwhile.
struct ShareMode {
    bool reads;
    bool writes;
    DWORD share; ///< FILE_SHARE_ flags
};

/// The share modes of the files that this process has open.
class ShareTable {
public:
    static ShareTable& Instance();

    /// @return false when the mode and that of another handle do not go together
    bool Enter(const FileId& file, const ShareMode& mode);
    void Leave(const FileId& file, const ShareMode& mode);

    /// Whether every handle of the file lets it be deleted.
    bool MayDelete(const FileId& file);

private:
    std::mutex m_mutex;
    std::multimap<FileId, ShareMode> m_modes;
};

} // namespace win32
