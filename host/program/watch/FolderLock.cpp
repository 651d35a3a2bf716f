#include "host/program/watch/FolderLock.h"

#include "host/program/base/PathText.h"

#include <windows.h>

#include <wx/intl.h>
#include <wx/utils.h>

#include <fstream>
#include <iterator>
#include <string>

namespace fs = std::filesystem;

namespace {

constexpr const char* LockName = ".quillon-watch";
constexpr const char* OwnerName = ".quillon-watch-owner"; // nobody can read a file that is locked

/// Opens the file for this program alone.
/// @param disposition CREATE_NEW or OPEN_EXISTING
/// @return null when it cannot be had
std::shared_ptr<void> Open(const fs::path& file, DWORD disposition) {
    HANDLE handle = CreateFileW(ToText(file).wc_str(), GENERIC_READ | GENERIC_WRITE, 0, nullptr,
                                disposition, FILE_ATTRIBUTE_NORMAL, nullptr);
    return handle == INVALID_HANDLE_VALUE ? nullptr : std::shared_ptr<void>(handle, CloseHandle);
}

wxString OwnerOf(const fs::path& folder) {
    std::ifstream file(folder / OwnerName, std::ios::binary);
    const std::string owner{std::istreambuf_iterator<char>(file), {}};
    return owner.empty() ? _("another program") : wxString::FromUTF8(owner);
}

void WriteOwner(const fs::path& folder) {
    const wxString owner = wxString::Format("%s, process %lu", wxGetHostName(), wxGetProcessId());
    std::ofstream(folder / OwnerName, std::ios::binary | std::ios::trunc) << owner.utf8_string();
}

} // namespace

std::optional<FolderLock> FolderLock::Take(const fs::path& folder, Fault& fault) {
    const fs::path file = folder / LockName;
    std::error_code ignored;
    std::shared_ptr<void> handle = Open(file, OPEN_EXISTING);
    if (!handle)
        handle = Open(file, CREATE_NEW);
    const bool isThere = fs::exists(file, ignored); // its last owner may just have removed it
    if (handle && isThere) {
        WriteOwner(folder);
        FolderLock lock(folder, std::move(handle));
        lock.m_file = LookAt(file, ignored).identity;
        return lock;
    }
    fault = isThere
                ? Fault{wxString::Format(_("%s is watched already, by %s"), Shown(folder),
                                         OwnerOf(folder)),
                        Blame::Usage}
                : Fault{wxString::Format(_("nothing can be written to %s; change its permissions"),
                                         Shown(folder)),
                        Blame::Machine};
    return std::nullopt;
}

std::optional<wxString> FolderLock::HolderOf(const fs::path& folder) {
    std::error_code ignored;
    const bool isHeld =
        fs::exists(folder / LockName, ignored) && !Open(folder / LockName, OPEN_EXISTING);
    return isHeld ? std::optional(OwnerOf(folder)) : std::nullopt;
}

FolderLock& FolderLock::operator=(FolderLock&& other) noexcept {
    Release();
    m_folder = std::move(other.m_folder);
    m_file = other.m_file;
    m_handle = std::move(other.m_handle);
    return *this;
}

FolderLock::~FolderLock() {
    Release();
}

/// The files go first, while nobody else can have them, where an open file can go.
void FolderLock::Release() {
    if (!m_handle)
        return;
    std::error_code error;
    const fs::path file = m_folder / LockName;
    const bool isOurs = LookAt(file, error).identity == m_file && !error;
    if (isOurs)
        fs::remove(m_folder / OwnerName, error);
    const bool isRemoved = isOurs && fs::remove(file, error);
    m_handle.reset();
    if (isOurs && !isRemoved)
        fs::remove(file, error);
}
