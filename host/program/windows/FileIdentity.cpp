#include "host/program/system/FileIdentity.h"

#include <windows.h>

#include <memory>

namespace fs = std::filesystem;

namespace {

std::uint64_t Joined(DWORD high, DWORD low) {
    return static_cast<std::uint64_t>(high) << 32 | low;
}

/// @param ticks of 100 ns from 1601; as nanoseconds from there, today's times would not fit
std::int64_t Nanoseconds(std::int64_t ticks) {
    constexpr std::int64_t Ticks1970 = 116'444'736'000'000'000;
    return (ticks - Ticks1970) * 100;
}

/// Not every file with data for a file system's driver is a link: some are only kept elsewhere.
bool StandsForAnother(HANDLE file) {
    FILE_ATTRIBUTE_TAG_INFO found = {};
    return GetFileInformationByHandleEx(file, FileAttributeTagInfo, &found, sizeof found) &&
           (found.FileAttributes & FILE_ATTRIBUTE_REPARSE_POINT) &&
           IsReparseTagNameSurrogate(found.ReparseTag);
}

fs::file_type Type(HANDLE file, DWORD attributes) {
    if ((attributes & FILE_ATTRIBUTE_REPARSE_POINT) && StandsForAnother(file))
        return fs::file_type::symlink;
    return (attributes & FILE_ATTRIBUTE_DIRECTORY) ? fs::file_type::directory
                                                   : fs::file_type::regular;
}

std::error_code LastError() {
    return {static_cast<int>(GetLastError()), std::system_category()};
}

} // namespace

FileLook LookAt(const fs::path& path, std::error_code& error) {
    constexpr DWORD Everything = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;
    constexpr DWORD LinksAndFolders = FILE_FLAG_OPEN_REPARSE_POINT | FILE_FLAG_BACKUP_SEMANTICS;
    HANDLE opened = CreateFileW(path.c_str(), FILE_READ_ATTRIBUTES, Everything, nullptr,
                                OPEN_EXISTING, LinksAndFolders, nullptr);
    if (opened == INVALID_HANDLE_VALUE) {
        error = LastError();
        return {};
    }
    const std::unique_ptr<void, decltype(&CloseHandle)> file(opened, CloseHandle);

    BY_HANDLE_FILE_INFORMATION found = {};
    FILE_BASIC_INFO times = {};
    if (!GetFileInformationByHandle(opened, &found) ||
        !GetFileInformationByHandleEx(opened, FileBasicInfo, &times, sizeof times)) {
        error = LastError();
        return {};
    }
    error.clear();

    FileLook look;
    look.identity.device = found.dwVolumeSerialNumber;
    look.identity.number = Joined(found.nFileIndexHigh, found.nFileIndexLow);
    look.identity.size = Joined(found.nFileSizeHigh, found.nFileSizeLow);
    look.identity.modified = Nanoseconds(times.LastWriteTime.QuadPart);
    look.changed = Nanoseconds(times.ChangeTime.QuadPart);
    look.type = Type(opened, found.dwFileAttributes);
    return look;
}
