#include "platform/win32/errors/ErrorCodes.h"
#include "platform/win32/files/OpenFile.h"
#include "platform/win32/log/LogSink.h"

#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

using win32::OpenFile;

BOOL WINAPI SetFilePointerEx(HANDLE file, LARGE_INTEGER distance, PLARGE_INTEGER newPosition,
                             DWORD moveMethod) {
    const std::shared_ptr<OpenFile> opened = win32::FileHandles().Find(file);
    if (!opened)
        return win32::Fail(ERROR_INVALID_HANDLE);
    if (moveMethod != FILE_BEGIN) {
        win32::Log("SetFilePointerEx: only distances from the beginning are supported");
        return win32::Fail(ERROR_INVALID_PARAMETER);
    }
    if (distance.QuadPart < 0)
        return win32::Fail(ERROR_NEGATIVE_SEEK);
    if (lseek(opened->Descriptor(), distance.QuadPart, SEEK_SET) < 0)
        return win32::Fail(win32::ErrorFromErrno(errno));
    if (newPosition)
        *newPosition = distance;
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
    struct stat status {};
    if (fstat(opened->Descriptor(), &status) != 0)
        return win32::Fail(win32::ErrorFromErrno(errno));
    size->QuadPart = status.st_size;
    return TRUE;
}
