#include "platform/win32/base/Errors.h"
#include "platform/win32/base/LogSink.h"
#include "platform/win32/modules/ModuleTable.h"
#include "platform/win32/text/Utf8.h"

BOOL WINAPI GetModuleHandleExW(DWORD flags, LPCWSTR moduleNameOrAddress, HMODULE* module) {
    constexpr DWORD Supported =
        GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS | GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT;
    if (!module)
        return win32::Fail(ERROR_INVALID_PARAMETER);
    *module = nullptr;
    if (flags != Supported) {
        win32::Log("GetModuleHandleExW: modules are found by an address alone, and not kept");
        return win32::Fail(ERROR_INVALID_PARAMETER);
    }
    *module = win32::ModuleTable::Instance().FindByAddress(moduleNameOrAddress);
    return *module || win32::Fail(ERROR_MOD_NOT_FOUND);
}

DWORD WINAPI GetModuleFileNameW(HMODULE module, LPWSTR fileName, DWORD size) {
    const std::optional<std::string> path =
        module ? win32::ModuleTable::Instance().PathOf(module) : win32::ProgramPath();
    if (!path) {
        SetLastError(ERROR_MOD_NOT_FOUND);
        return 0;
    }
    if (!fileName || size == 0) {
        SetLastError(ERROR_INSUFFICIENT_BUFFER);
        return 0;
    }
    const std::wstring text = win32::FromUtf8(*path);
    const bool fits = text.size() < size;
    const std::size_t length = text.copy(fileName, size - 1);
    fileName[length] = L'\0';
    SetLastError(fits ? ERROR_SUCCESS : ERROR_INSUFFICIENT_BUFFER);
    return fits ? static_cast<DWORD>(length) : size;
}
