#include "standins/module/ModulePath.h"

#include "standins/module/Text.h"

#include <windows.h>

#include <filesystem>

namespace fs = std::filesystem;

namespace standins {

namespace {

const char AddressHere = 0;

} // namespace

std::wstring ModulePath() {
    HMODULE module = nullptr;
    GetModuleHandleExW(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS |
                           GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
                       reinterpret_cast<LPCWSTR>(&AddressHere), &module);
    for (std::wstring path(MAX_PATH, L'\0');; path.resize(2 * path.size())) {
        const DWORD length =
            GetModuleFileNameW(module, path.data(), static_cast<DWORD>(path.size()));
        if (length < path.size()) {
            path.resize(length);
            return path;
        }
    }
}

std::string HelperPath(const std::string& name) {
    const fs::path module = ToUtf8(ModulePath()).value_or(std::string());
    std::error_code error;
    const fs::path file = fs::canonical(module, error); // it may have been loaded by a link
    return ((error ? module : file).parent_path() / name).lexically_normal();
}

} // namespace standins
