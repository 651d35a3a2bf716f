#include "standins/inprocess/Paths.h"

#include "standins/shared/Text.h"

#include <windows.h>

#include <cstdlib>
#include <filesystem>
#include <sstream>

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

std::vector<std::string> SearchPath() {
    const char* path = std::getenv("PATH"); // NOLINT(concurrency-mt-unsafe): nobody changes it
    std::istringstream list(path ? path : "/usr/local/bin:/usr/bin:/bin");
    std::vector<std::string> folders;
    for (std::string folder; std::getline(list, folder, ':');)
        folders.push_back(folder);
    return folders;
}

} // namespace standins
