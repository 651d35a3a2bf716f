#include "platform/win32/base/LogSink.h"
#include "platform/win32/registry/Registry.h"

using win32::Registry;
using win32::RegistryKey;

namespace {

constexpr std::size_t LongestKeyName = 255;
constexpr std::size_t MostNewLevels = 32; // by one call

bool IsSupportedAccess(REGSAM access) {
    if ((access & ~(KEY_READ | KEY_WRITE)) == 0)
        return true;
    win32::Log("registry: access rights beyond KEY_READ and KEY_WRITE are not supported");
    return false;
}

bool IsSupportedPath(LPCWSTR path) {
    return !path || path[0] != L'\\';
}

void MarkDeleted(RegistryKey& key) {
    for (const auto& [name, subKey] : key.subKeys)
        MarkDeleted(*subKey);
    key.subKeys.clear();
    key.values.clear();
    key.deleted = true;
}

} // namespace

LSTATUS WINAPI RegOpenKeyExW(HKEY key, LPCWSTR subKey, DWORD options, REGSAM access, PHKEY result) {
    if (!result || options != 0)
        return ERROR_INVALID_PARAMETER;
    if (!IsSupportedAccess(access))
        return ERROR_ACCESS_DENIED;
    if (!IsSupportedPath(subKey))
        return ERROR_BAD_PATHNAME;
    Registry& registry = Registry::Instance();
    const auto lock = registry.Lock();
    std::shared_ptr<RegistryKey> start;
    if (const LSTATUS resolved = registry.Resolve(key, 0, start); resolved != ERROR_SUCCESS)
        return resolved;
    std::vector<std::wstring> missing;
    std::shared_ptr<RegistryKey> found = win32::FollowPath(start, subKey ? subKey : L"", missing);
    if (!missing.empty())
        return ERROR_FILE_NOT_FOUND;
    *result = registry.Open(std::move(found), access);
    return ERROR_SUCCESS;
}

// A new key needs no right of the handle: Windows asks the parent key's protection, and these keys
// have none.
LSTATUS WINAPI RegCreateKeyExW(HKEY key, LPCWSTR subKey, DWORD reserved, LPWSTR keyClass,
                               DWORD options, REGSAM access,
                               LPSECURITY_ATTRIBUTES securityAttributes, PHKEY result,
                               LPDWORD disposition) {
    if (!result || !subKey || reserved != 0)
        return ERROR_INVALID_PARAMETER;
    if (keyClass || options != REG_OPTION_NON_VOLATILE || securityAttributes || disposition) {
        win32::Log("RegCreateKeyExW: only a path and access rights are supported");
        return ERROR_INVALID_PARAMETER;
    }
    if (!IsSupportedAccess(access))
        return ERROR_ACCESS_DENIED;
    if (!IsSupportedPath(subKey))
        return ERROR_BAD_PATHNAME;
    Registry& registry = Registry::Instance();
    const auto lock = registry.Lock();
    std::shared_ptr<RegistryKey> start;
    if (const LSTATUS resolved = registry.Resolve(key, 0, start); resolved != ERROR_SUCCESS)
        return resolved;
    std::vector<std::wstring> missing;
    std::shared_ptr<RegistryKey> found = win32::FollowPath(start, subKey, missing);
    if (missing.size() > MostNewLevels)
        return ERROR_INVALID_PARAMETER;
    for (const std::wstring& name : missing)
        if (name.size() > LongestKeyName)
            return ERROR_INVALID_PARAMETER;
    found = win32::AddSubKeys(found, missing);
    *result = registry.Open(std::move(found), access);
    return ERROR_SUCCESS;
}

LSTATUS WINAPI RegCloseKey(HKEY key) {
    return Registry::Instance().Close(key);
}

LSTATUS WINAPI RegDeleteTreeW(HKEY key, LPCWSTR subKey) {
    if (!subKey || !*subKey) {
        win32::Log("RegDeleteTreeW: only a subkey can be deleted");
        return ERROR_INVALID_PARAMETER;
    }
    if (!IsSupportedPath(subKey))
        return ERROR_BAD_PATHNAME;
    Registry& registry = Registry::Instance();
    const auto lock = registry.Lock();
    std::shared_ptr<RegistryKey> start;
    if (const LSTATUS resolved = registry.Resolve(key, 0, start); resolved != ERROR_SUCCESS)
        return resolved;
    std::wstring path(subKey);
    path.erase(path.find_last_not_of(L'\\') + 1);
    const std::size_t split = path.find_last_of(L'\\');
    const std::wstring folder = split == std::wstring::npos ? L"" : path.substr(0, split);
    std::vector<std::wstring> missing;
    const std::shared_ptr<RegistryKey> parent = win32::FollowPath(start, folder, missing);
    const std::shared_ptr<RegistryKey> doomed = win32::FollowPath(start, path, missing);
    if (!missing.empty())
        return ERROR_FILE_NOT_FOUND;
    MarkDeleted(*doomed);
    for (auto entry = parent->subKeys.begin(); entry != parent->subKeys.end(); ++entry)
        if (entry->second == doomed) {
            parent->subKeys.erase(entry);
            break;
        }
    return ERROR_SUCCESS;
}
