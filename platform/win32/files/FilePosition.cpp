#include "platform/win32/base/Errors.h"
#include "platform/win32/files/OpenFile.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <limits>

using win32::OpenFile;

namespace {

/// @return the size in bytes, or -1 with errno set
off_t SizeOf(const OpenFile& file) {
    struct stat status {};
    return fstat(file.Descriptor(), &status) == 0 ? status.st_size : -1;
}

/// Where a move from `method` on leads, without going there.
/// @return a system error code
DWORD FindPosition(const OpenFile& file, LONGLONG distance, DWORD method, off_t& position) {
    off_t start = 0;
    if (method == FILE_CURRENT)
        start = lseek(file.Descriptor(), 0, SEEK_CUR);
    else if (method == FILE_END)
        start = SizeOf(file);
    else if (method != FILE_BEGIN)
        return ERROR_INVALID_PARAMETER;
    if (start < 0)
        return win32::ErrorFromErrno(errno);
    if (distance < -start)
        return ERROR_NEGATIVE_SEEK;
    if (distance > std::numeric_limits<LONGLONG>::max() - start)
        return ERROR_INVALID_PARAMETER;
    position = start + distance;
    return ERROR_SUCCESS;
}

} // namespace

BOOL WINAPI SetFilePointerEx(HANDLE file, LARGE_INTEGER distance, PLARGE_INTEGER newPosition,
                             DWORD moveMethod) {
    const std::shared_ptr<OpenFile> opened = win32::FileHandles().Find(file);
    if (!opened)
        return win32::Fail(ERROR_INVALID_HANDLE);
    off_t position = 0;
    const DWORD error = FindPosition(*opened, distance.QuadPart, moveMethod, position);
    if (error != ERROR_SUCCESS)
        return win32::Fail(error);
    if (lseek(opened->Descriptor(), position, SEEK_SET) < 0)
        return win32::Fail(win32::ErrorFromErrno(errno));
    if (newPosition)
        newPosition->QuadPart = position;
    return TRUE;
}

BOOL WINAPI SetEndOfFile(HANDLE file) {
    const std::shared_ptr<OpenFile> opened = win32::FileHandles().Find(file);
    if (!opened)
        return win32::Fail(ERROR_INVALID_HANDLE);
    if (!opened->MayWrite())
        return win32::Fail(ERROR_ACCESS_DENIED);
    const off_t position = lseek(opened->Descriptor(), 0, SEEK_CUR);
    if (position < 0 || ftruncate(opened->Descriptor(), position) != 0)
        return win32::Fail(win32::ErrorFromErrno(errno));
    return TRUE;
}

BOOL WINAPI GetFileSizeEx(HANDLE file, PLARGE_INTEGER size) {
    const std::shared_ptr<OpenFile> opened = win32::FileHandles().Find(file);
    if (!opened)
        return win32::Fail(ERROR_INVALID_HANDLE);
    if (!size)
        return win32::Fail(ERROR_INVALID_PARAMETER);
    size->QuadPart = SizeOf(*opened);
    return size->QuadPart >= 0 || win32::Fail(win32::ErrorFromErrno(errno));
}
