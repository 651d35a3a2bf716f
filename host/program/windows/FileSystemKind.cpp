#include "host/program/system/FileSystemKind.h"

#include <windows.h>

bool IsShare(const std::filesystem::path& folder) {
    std::error_code ignored;
    const std::filesystem::path full = std::filesystem::absolute(folder, ignored);
    wchar_t root[MAX_PATH + 1] = {}; // may be below a drive's, where a share is mounted in a folder
    return GetVolumePathNameW(full.c_str(), root, MAX_PATH) && GetDriveTypeW(root) == DRIVE_REMOTE;
}

Writers AskForWriters(const std::filesystem::path& file) {
    HANDLE opened = CreateFileW(file.c_str(), GENERIC_READ, FILE_SHARE_READ, nullptr, OPEN_EXISTING,
                                FILE_FLAG_OPEN_REPARSE_POINT, nullptr);
    if (opened == INVALID_HANDLE_VALUE)
        return GetLastError() == ERROR_SHARING_VIOLATION ? Writers::Some : Writers::Unknown;
    CloseHandle(opened);
    return Writers::None;
}

WritersKnown WritersKnownIn(const std::filesystem::path& folder) {
    std::error_code error;
    const bool isLocal = std::filesystem::is_directory(folder, error) && !IsShare(folder);
    return isLocal ? WritersKnown::OfAll : WritersKnown::OfNone;
}
