#include "platform/win32/errors/ErrorCodes.h"
#include "platform/win32/files/OpenFile.h"
#include "platform/win32/text/Utf8.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

BOOL WINAPI DeleteFileW(LPCWSTR fileName) {
    if (!fileName || !*fileName)
        return win32::Fail(ERROR_PATH_NOT_FOUND);
    const std::optional<std::string> path = win32::ToUtf8(fileName);
    if (!path)
        return win32::Fail(ERROR_INVALID_NAME);
    struct stat status {};
    if (lstat(path->c_str(), &status) != 0)
        return win32::Fail(win32::PathError(errno, *path));
    constexpr mode_t AnyWrite = S_IWUSR | S_IWGRP | S_IWOTH;
    const bool isReadOnly = S_ISREG(status.st_mode) && (status.st_mode & AnyWrite) == 0;
    if (S_ISDIR(status.st_mode) || isReadOnly)
        return win32::Fail(ERROR_ACCESS_DENIED);
    if (!win32::ShareTable::Instance().MayDelete({status.st_dev, status.st_ino}))
        return win32::Fail(ERROR_SHARING_VIOLATION);
    return unlink(path->c_str()) == 0 || win32::Fail(win32::PathError(errno, *path));
}
