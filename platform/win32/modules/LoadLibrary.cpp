#include "platform/win32/base/Errors.h"
#include "platform/win32/base/LogSink.h"
#include "platform/win32/modules/ModuleTable.h"
#include "platform/win32/text/Utf8.h"

#include <dlfcn.h>
#include <link.h>

#include <filesystem>

namespace fs = std::filesystem;

namespace {

/// Where a module of this name is looked for: nowhere without a folder.
std::optional<fs::path> PathOfName(LPCWSTR name) {
    const std::optional<std::string> utf8 = name ? win32::ToUtf8(name) : std::nullopt;
    const fs::path path(utf8.value_or(std::string()));
    return path.has_parent_path() ? std::optional(fs::absolute(path).lexically_normal())
                                  : std::nullopt;
}

bool IsWithin(HMODULE module, const void* address) {
    Dl_info info{};
    void* owner = nullptr;
    return dladdr1(address, &info, &owner, RTLD_DL_LINKMAP) != 0 && owner == module;
}

} // namespace

HMODULE WINAPI LoadLibraryW(LPCWSTR fileName) {
    const std::optional<fs::path> path = PathOfName(fileName);
    std::error_code error;
    const fs::file_status status = path ? fs::status(*path, error) : fs::file_status();
    if (!fs::exists(status)) {
        SetLastError(ERROR_MOD_NOT_FOUND);
        return nullptr;
    }
    std::string reason = "not a regular file";
    HMODULE module = nullptr;
    if (fs::is_regular_file(status))
        module = win32::ModuleTable::Instance().Load(path->string(), reason);
    if (!module) {
        win32::Log("LoadLibraryW: " + path->string() + ": " + reason);
        SetLastError(ERROR_BAD_EXE_FORMAT);
    }
    return module;
}

BOOL WINAPI FreeLibrary(HMODULE module) {
    return win32::ModuleTable::Instance().Release(module) || win32::Fail(ERROR_MOD_NOT_FOUND);
}

FARPROC WINAPI GetProcAddress(HMODULE module, LPCSTR procName) {
    if (!win32::ModuleTable::Instance().PathOf(module)) {
        SetLastError(ERROR_MOD_NOT_FOUND);
        return nullptr;
    }
    const bool isOrdinal = reinterpret_cast<ULONG_PTR>(procName) <= 0xFFFF;
    if (isOrdinal)
        win32::Log("GetProcAddress: exports have no ordinals here");
    // The loader would look on in the libraries below; an export is the module's own.
    void* found = isOrdinal ? nullptr : dlsym(module, procName);
    if (!found || !IsWithin(module, found)) {
        SetLastError(ERROR_PROC_NOT_FOUND);
        return nullptr;
    }
    return reinterpret_cast<FARPROC>(found);
}

HMODULE WINAPI GetModuleHandleW(LPCWSTR moduleName) {
    win32::ModuleTable& modules = win32::ModuleTable::Instance();
    if (!moduleName)
        return modules.Program();
    const std::optional<fs::path> path = PathOfName(moduleName);
    HMODULE module = path ? modules.FindLoaded(path->string()) : nullptr;
    if (!module)
        SetLastError(ERROR_MOD_NOT_FOUND);
    return module;
}
