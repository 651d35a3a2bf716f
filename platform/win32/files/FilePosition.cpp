#include "platform/win32/errors/ErrorCodes.h"
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
/// @param limit the last position that the caller can be told
/// @return a system error code
DWORD FindPosition(const OpenFile& file, LONGLONG distance, DWORD method, LONGLONG limit,
                   off_t& position) {
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
    if (distance > limit - start)
        return ERROR_INVALID_PARAMETER;
    position = start + distance;
    return ERROR_SUCCESS;
}

DWORD Move(HANDLE file, LONGLONG distance, DWORD method, LONGLONG limit, off_t& position) {
    const std::shared_ptr<OpenFile> opened = win32::FileHandles().Find(file);
    if (!opened)
        return ERROR_INVALID_HANDLE;
    const DWORD found = FindPosition(*opened, distance, method, limit, position);
    if (found != ERROR_SUCCESS)
        return found;
    const bool moved = lseek(opened->Descriptor(), position, SEEK_SET) >= 0;
    return moved ? ERROR_SUCCESS : win32::ErrorFromErrno(errno);
}

} // namespace

// All bits set may be an error or the lower half of a position; the last error tells.
DWORD WINAPI SetFilePointer(HANDLE file, LONG distance, PLONG distanceHigh, DWORD moveMethod) {
    LONGLONG whole = distance;
    LONGLONG limit = std::numeric_limits<DWORD>::max();
    if (distanceHigh) {
        const ULONGLONG high = static_cast<DWORD>(*distanceHigh);
        whole = static_cast<LONGLONG>(high << 32 | static_cast<DWORD>(distance));
        limit = std::numeric_limits<LONGLONG>::max();
    }
    off_t position = 0;
    const DWORD error = Move(file, whole, moveMethod, limit, position);
    if (error != ERROR_SUCCESS) {
        SetLastError(error);
        return INVALID_SET_FILE_POINTER;
    }
    if (distanceHigh)
        *distanceHigh = static_cast<LONG>(position >> 32);
    SetLastError(ERROR_SUCCESS);
    return static_cast<DWORD>(position);
}

BOOL WINAPI SetFilePointerEx(HANDLE file, LARGE_INTEGER distance, PLARGE_INTEGER newPosition,
                             DWORD moveMethod) {
    off_t position = 0;
    const DWORD error =
        Move(file, distance.QuadPart, moveMethod, std::numeric_limits<LONGLONG>::max(), position);
    if (error != ERROR_SUCCESS)
        return win32::Fail(error);
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

DWORD WINAPI GetFileSize(HANDLE file, LPDWORD sizeHigh) {
    LARGE_INTEGER size{};
    if (!GetFileSizeEx(file, &size))
        return INVALID_FILE_SIZE;
    if (sizeHigh)
        *sizeHigh = static_cast<DWORD>(size.QuadPart >> 32);
    SetLastError(ERROR_SUCCESS); // the lower half may look like an error
    return static_cast<DWORD>(size.QuadPart);
}
