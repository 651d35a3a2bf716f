#include "platform/win32/log/LogSink.h"
#include "platform/win32/registry/Registry.h"

using win32::Registry;
using win32::RegistryKey;

namespace {

constexpr std::size_t LongestKeyName = 255;
constexpr std::size_t MostNewLevels = 32; // by one call

bool IsSupportedAccess(REGSAM access) {
    if ((access & ~KEY_ALL_ACCESS) == 0)
        return true;
    win32::Log("registry: access rights beyond KEY_ALL_ACCESS are not supported");
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

void CopyOut(const std::wstring& text, LPWSTR buffer, LPDWORD size) {
    text.copy(buffer, text.size());
    buffer[text.size()] = L'\0';
    *size = static_cast<DWORD>(text.size());
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
    if (keyClass || options != REG_OPTION_NON_VOLATILE || securityAttributes) {
        win32::Log("RegCreateKeyExW: classes, options and security attributes are not supported");
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
    if (disposition)
        *disposition = missing.empty() ? REG_OPENED_EXISTING_KEY : REG_CREATED_NEW_KEY;
    return ERROR_SUCCESS;
}

LSTATUS WINAPI RegCloseKey(HKEY key) {
    return Registry::Instance().Close(key);
}

LSTATUS WINAPI RegDeleteTreeW(HKEY key, LPCWSTR subKey) {
    const bool keyItself = !subKey || !*subKey;
    if (!IsSupportedPath(subKey))
        return ERROR_BAD_PATHNAME;
    Registry& registry = Registry::Instance();
    const auto lock = registry.Lock();
    const REGSAM needed =
        keyItself ? KEY_ENUMERATE_SUB_KEYS | KEY_QUERY_VALUE | KEY_SET_VALUE : REGSAM{0};
    std::shared_ptr<RegistryKey> start;
    if (const LSTATUS resolved = registry.Resolve(key, needed, start); resolved != ERROR_SUCCESS)
        return resolved;
    if (keyItself) {
        MarkDeleted(*start);
        start->deleted = false; // it loses what it holds and stays
        return ERROR_SUCCESS;
    }
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

LSTATUS WINAPI RegEnumKeyExW(HKEY key, DWORD index, LPWSTR name, LPDWORD nameSize, LPDWORD reserved,
                             LPWSTR keyClass, LPDWORD keyClassSize, PFILETIME lastWriteTime) {
    if (!name || !nameSize || reserved || (keyClass && !keyClassSize))
        return ERROR_INVALID_PARAMETER;
    if (lastWriteTime) {
        win32::Log("RegEnumKeyExW: the time of the last write is not kept");
        return ERROR_INVALID_PARAMETER;
    }
    Registry& registry = Registry::Instance();
    const auto lock = registry.Lock();
    std::shared_ptr<RegistryKey> start;
    if (const LSTATUS resolved = registry.Resolve(key, KEY_ENUMERATE_SUB_KEYS, start);
        resolved != ERROR_SUCCESS)
        return resolved;
    if (index >= start->subKeys.size())
        return ERROR_NO_MORE_ITEMS;
    const std::wstring& found = std::next(start->subKeys.begin(), index)->second->name;
    if (found.size() >= *nameSize || (keyClass && *keyClassSize == 0))
        return ERROR_MORE_DATA;
    CopyOut(found, name, nameSize);
    if (keyClass)
        CopyOut({}, keyClass, keyClassSize);
    else if (keyClassSize)
        *keyClassSize = 0;
    return ERROR_SUCCESS;
}
