#include "platform/win32/errors/ErrorCodes.h"
#include "platform/win32/files/OpenFile.h"
#include "platform/win32/log/LogSink.h"

namespace {

DWORD CheckArguments(DWORD desiredAccess, DWORD shareMode, LPSECURITY_ATTRIBUTES security,
                     DWORD creationDisposition, DWORD flagsAndAttributes, HANDLE templateFile) {
    constexpr DWORD EveryShare = FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE;
    const bool canTruncate = (desiredAccess & GENERIC_WRITE) != 0;
    if ((shareMode & ~EveryShare) != 0 || creationDisposition < CREATE_NEW ||
        creationDisposition > TRUNCATE_EXISTING ||
        (creationDisposition == TRUNCATE_EXISTING && !canTruncate))
        return ERROR_INVALID_PARAMETER;
    const bool isInherited = security && security->bInheritHandle;
    const bool isProtected = security && security->lpSecurityDescriptor;
    if ((desiredAccess & ~(GENERIC_READ | GENERIC_WRITE)) != 0 || isInherited || isProtected ||
        (flagsAndAttributes & ~FILE_ATTRIBUTE_NORMAL) != 0 || templateFile) {
        win32::Log("CreateFileW: only generic rights and normal attributes are supported");
        return ERROR_NOT_SUPPORTED;
    }
    return ERROR_SUCCESS;
}

} // namespace

HANDLE WINAPI CreateFileW(LPCWSTR fileName, DWORD desiredAccess, DWORD shareMode,
                          LPSECURITY_ATTRIBUTES securityAttributes, DWORD creationDisposition,
                          DWORD flagsAndAttributes, HANDLE templateFile) {
    DWORD error = CheckArguments(desiredAccess, shareMode, securityAttributes, creationDisposition,
                                 flagsAndAttributes, templateFile);
    std::shared_ptr<win32::OpenFile> file;
    bool existed = false;
    if (error == ERROR_SUCCESS)
        error = win32::OpenFile::Open(fileName, {desiredAccess, shareMode, creationDisposition},
                                      file, existed);
    if (error != ERROR_SUCCESS) {
        SetLastError(error);
        return INVALID_HANDLE_VALUE;
    }
    if (creationDisposition == CREATE_ALWAYS || creationDisposition == OPEN_ALWAYS)
        SetLastError(existed ? ERROR_ALREADY_EXISTS : ERROR_SUCCESS);
    return win32::FileHandles().Add(std::move(file));
}

BOOL WINAPI CloseHandle(HANDLE object) {
    return win32::FileHandles().Remove(object) || win32::Fail(ERROR_INVALID_HANDLE);
}
