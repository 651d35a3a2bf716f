#include "host/program/system/FolderBell.h"

#include "host/program/system/FileIdentity.h"

#include <windows.h>

#include <algorithm>
#include <map>
#include <vector>

namespace fs = std::filesystem;

namespace {

constexpr DWORD InFolder = FILE_NOTIFY_CHANGE_FILE_NAME | FILE_NOTIFY_CHANGE_DIR_NAME |
                           FILE_NOTIFY_CHANGE_ATTRIBUTES | FILE_NOTIFY_CHANGE_SIZE |
                           FILE_NOTIFY_CHANGE_LAST_WRITE;

/// Beside the one for rings.
constexpr std::size_t MostFolders = MAXIMUM_WAIT_OBJECTS - 1;

struct Watched {
    std::unique_ptr<void, decltype(&FindCloseChangeNotification)> changes;
    FileIdentity identity; ///< of the folder
};

bool IsSameFolder(const FileIdentity& a, const FileIdentity& b) {
    return a.device == b.device && a.number == b.number;
}

} // namespace

class FolderBell::System {
public:
    bool Watch(const fs::path& folder) {
        std::error_code error;
        const FileIdentity identity = LookAt(folder, error).identity;
        const auto known = m_folders.find(folder);
        if (known != m_folders.end()) {
            if (!error && IsSameFolder(known->second.identity, identity))
                return true;
            m_folders.erase(known);
        }
        if (!error && LiesInWatched(folder))
            return true;
        if (error || m_folders.size() == MostFolders)
            return false;
        HANDLE changes = FindFirstChangeNotificationW(folder.c_str(), TRUE, InFolder);
        if (changes == INVALID_HANDLE_VALUE)
            return false;
        m_folders.emplace(folder, Watched{{changes, FindCloseChangeNotification}, identity});
        return true;
    }

    bool Wait(std::chrono::milliseconds longest) {
        std::vector<HANDLE> objects = {m_rung.get()};
        for (const auto& [folder, watched] : m_folders)
            objects.push_back(watched.changes.get());
        constexpr std::chrono::milliseconds Most{INFINITE - 1};
        const auto time = static_cast<DWORD>(
            std::clamp(longest, std::chrono::milliseconds::zero(), Most).count());
        const DWORD found =
            WaitForMultipleObjects(static_cast<DWORD>(objects.size()), objects.data(), FALSE, time);
        if (found == WAIT_TIMEOUT)
            return false;
        TakeChanges();
        return true;
    }

    void Ring() { SetEvent(m_rung.get()); }

private:
    /// Whether a folder above it rings for it. It has no handle of its own then, with which it
    /// could not be removed.
    bool LiesInWatched(const fs::path& folder) const {
        for (fs::path above = folder.parent_path(); above != above.parent_path();
             above = above.parent_path())
            if (m_folders.count(above) != 0)
                return true;
        return false;
    }

    /// Has all that have rung ready to ring again.
    void TakeChanges() {
        WaitForSingleObject(m_rung.get(), 0);
        for (auto each = m_folders.begin(); each != m_folders.end();) {
            HANDLE changes = each->second.changes.get();
            const bool hasRung = WaitForSingleObject(changes, 0) == WAIT_OBJECT_0;
            if (hasRung && !FindNextChangeNotification(changes))
                each = m_folders.erase(each); // the folder has gone
            else
                ++each;
        }
    }

    const std::unique_ptr<void, decltype(&CloseHandle)> m_rung{
        CreateEventW(nullptr, FALSE, FALSE, nullptr), CloseHandle};
    std::map<fs::path, Watched> m_folders;
};

FolderBell::FolderBell() : m_system(std::make_unique<System>()) {}

FolderBell::~FolderBell() = default;

bool FolderBell::Watch(const fs::path& folder) {
    return m_system->Watch(folder);
}

bool FolderBell::Wait(std::chrono::milliseconds longest) {
    return m_system->Wait(longest);
}

void FolderBell::Ring() {
    m_system->Ring();
}
