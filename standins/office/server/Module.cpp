#include "standins/office/server/Module.h"

#include "standins/module/Text.h"

#include <windows.h>

#include <atomic>
#include <filesystem>

namespace standins {

namespace {

std::atomic<long> g_uses = 0;

} // namespace

std::wstring ModulePath() {
    HMODULE module = nullptr;
    GetModuleHandleExW(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS |
                           GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
                       reinterpret_cast<LPCWSTR>(&g_uses), &module);
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
    const std::filesystem::path module = ToUtf8(ModulePath()).value_or(std::string());
    return module.parent_path() / name;
}

ModuleUse::ModuleUse() {
    LockModule(true);
}

ModuleUse::~ModuleUse() {
    LockModule(false);
}

void LockModule(bool lock) {
    g_uses += lock ? 1 : -1;
}

bool IsModuleInUse() {
    return g_uses > 0;
}

} // namespace standins
