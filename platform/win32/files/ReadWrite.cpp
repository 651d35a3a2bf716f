#include "platform/win32/base/Errors.h"
#include "platform/win32/base/LogSink.h"
#include "platform/win32/files/OpenFile.h"

#include <unistd.h>

#include <algorithm>
#include <cerrno>

using win32::OpenFile;

namespace {

// One call of the system moves less than 2 GiB, one call of this API anything below 4 GiB.
constexpr std::size_t MostPerCall = std::size_t{1} << 30;

/// Repeats `transfer` (bytes done so far, bytes to do now) until all is done, the file ends or the
/// system refuses.
/// @param done receives how much was done, which is something even when the call fails
/// @return a system error code
template <typename Transfer>
DWORD TransferAll(DWORD size, DWORD& done, Transfer transfer) {
    while (done < size) {
        const ssize_t moved = transfer(done, std::min<std::size_t>(size - done, MostPerCall));
        if (moved == 0)
            break;
        if (moved > 0)
            done += static_cast<DWORD>(moved);
        else if (errno != EINTR)
            return win32::ErrorFromErrno(errno);
    }
    return ERROR_SUCCESS;
}

DWORD CheckArguments(const OpenFile* file, const void* buffer, DWORD size, const DWORD* done,
                     const void* overlapped) {
    if (!file)
        return ERROR_INVALID_HANDLE;
    if (overlapped) {
        win32::Log("ReadFile, WriteFile: overlapped transfers are not supported");
        return ERROR_INVALID_PARAMETER;
    }
    if (!done)
        return ERROR_INVALID_PARAMETER;
    return buffer || size == 0 ? ERROR_SUCCESS : ERROR_NOACCESS;
}

} // namespace

BOOL WINAPI ReadFile(HANDLE file, LPVOID buffer, DWORD bytesToRead, LPDWORD bytesRead,
                     LPVOID overlapped) {
    if (bytesRead)
        *bytesRead = 0;
    const std::shared_ptr<OpenFile> opened = win32::FileHandles().Find(file);
    DWORD error = CheckArguments(opened.get(), buffer, bytesToRead, bytesRead, overlapped);
    if (error == ERROR_SUCCESS && !opened->MayRead())
        error = ERROR_ACCESS_DENIED;
    if (error == ERROR_SUCCESS)
        error = TransferAll(bytesToRead, *bytesRead, [&](DWORD done, std::size_t size) {
            return read(opened->Descriptor(), static_cast<char*>(buffer) + done, size);
        });
    return error == ERROR_SUCCESS || win32::Fail(error);
}

BOOL WINAPI WriteFile(HANDLE file, LPCVOID buffer, DWORD bytesToWrite, LPDWORD bytesWritten,
                      LPVOID overlapped) {
    if (bytesWritten)
        *bytesWritten = 0;
    const std::shared_ptr<OpenFile> opened = win32::FileHandles().Find(file);
    DWORD error = CheckArguments(opened.get(), buffer, bytesToWrite, bytesWritten, overlapped);
    if (error == ERROR_SUCCESS && !opened->MayWrite())
        error = ERROR_ACCESS_DENIED;
    if (error == ERROR_SUCCESS)
        error = TransferAll(bytesToWrite, *bytesWritten, [&](DWORD done, std::size_t size) {
            return write(opened->Descriptor(), static_cast<const char*>(buffer) + done, size);
        });
    return error == ERROR_SUCCESS || win32::Fail(error);
}
