#include "platform/win32/base/Errors.h"
#include "platform/win32/base/LogSink.h"
#include "platform/win32/files/OpenFile.h"

namespace {

DWORD CheckArguments(const win32::OpenRequest& request, bool isProtected, DWORD flagsAndAttributes,
                     HANDLE templateFile) {
    if ((request.share & ~FILE_SHARE_READ) != 0 ||
        (request.disposition != CREATE_NEW && request.disposition != OPEN_EXISTING)) {
        win32::Log("CreateFileW: such share modes or dispositions are not supported");
        return ERROR_INVALID_PARAMETER;
    }
    if (request.access == 0 || (request.access & ~(GENERIC_READ | GENERIC_WRITE)) != 0 ||
        isProtected || (flagsAndAttributes & ~FILE_ATTRIBUTE_NORMAL) != 0 || templateFile) {
        win32::Log("CreateFileW: only generic rights and normal attributes are supported");
        return ERROR_NOT_SUPPORTED;
    }
    return ERROR_SUCCESS;
}

} // namespace

HANDLE WINAPI CreateFileW(LPCWSTR fileName, DWORD desiredAccess, DWORD shareMode,
                          LPSECURITY_ATTRIBUTES securityAttributes, DWORD creationDisposition,
                          DWORD flagsAndAttributes, HANDLE templateFile) {
    const win32::OpenRequest request{desiredAccess, shareMode, creationDisposition};
    DWORD error =
        CheckArguments(request, securityAttributes != nullptr, flagsAndAttributes, templateFile);
    std::shared_ptr<win32::OpenFile> file;
    if (error == ERROR_SUCCESS)
        error = win32::OpenFile::Open(fileName, request, file);
    if (error != ERROR_SUCCESS) {
        SetLastError(error);
        return INVALID_HANDLE_VALUE;
    }
    return win32::FileHandles().Add(std::move(file));
}

BOOL WINAPI CloseHandle(HANDLE object) {
    return win32::FileHandles().Remove(object) || win32::Fail(ERROR_INVALID_HANDLE);
}
