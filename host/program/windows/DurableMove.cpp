#include "host/program/system/DurableMove.h"

#include <windows.h>

#include <memory>

namespace fs = std::filesystem;

namespace {

std::error_code LastError() {
    return {static_cast<int>(GetLastError()), std::system_category()};
}

std::error_code Move(const fs::path& from, const fs::path& to, DWORD flags) {
    const std::error_code error = SyncFile(from);
    if (error && error.value() != ERROR_ACCESS_DENIED) // not ours to write, nor to write out
        return error;
    return MoveFileExW(from.c_str(), to.c_str(), flags | MOVEFILE_WRITE_THROUGH) ? std::error_code()
                                                                                 : LastError();
}

} // namespace

std::error_code SyncFile(const fs::path& path) {
    constexpr DWORD Everything = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;
    HANDLE opened = CreateFileW(path.c_str(), GENERIC_WRITE, Everything, nullptr, OPEN_EXISTING,
                                FILE_ATTRIBUTE_NORMAL, nullptr);
    if (opened == INVALID_HANDLE_VALUE)
        return LastError();
    const std::unique_ptr<void, decltype(&CloseHandle)> file(opened, CloseHandle);
    if (FlushFileBuffers(opened) || GetLastError() == ERROR_INVALID_FUNCTION) // it cannot do it
        return {};
    return LastError();
}

std::error_code MoveWithoutReplacing(const fs::path& from, const fs::path& to) {
    return Move(from, to, 0);
}

std::error_code MoveDurably(const fs::path& from, const fs::path& to) {
    return Move(from, to, MOVEFILE_REPLACE_EXISTING);
}

/// Folders cannot be flushed here; the move itself has waited for the disk.
std::error_code SyncFolder(const fs::path& /*folder*/) {
    return {};
}
