#include "platform/win32/registry/Registry.h"
#include "platform/win32/text/CaseFold.h"

#include <algorithm>

using win32::Registry;
using win32::RegistryKey;
using win32::RegistryValue;

namespace {

constexpr std::size_t LongestValueName = 16383;

/// The default value is the one without a name.
std::wstring IndexOf(LPCWSTR valueName) {
    return valueName ? win32::CaseFold(valueName) : std::wstring();
}

} // namespace

LSTATUS WINAPI RegQueryValueExW(HKEY key, LPCWSTR valueName, LPDWORD reserved, LPDWORD type,
                                LPBYTE data, LPDWORD dataSize) {
    if (reserved || (data && !dataSize))
        return ERROR_INVALID_PARAMETER;
    Registry& registry = Registry::Instance();
    const auto lock = registry.Lock();
    std::shared_ptr<RegistryKey> owner;
    if (const LSTATUS resolved = registry.Resolve(key, KEY_QUERY_VALUE, owner);
        resolved != ERROR_SUCCESS)
        return resolved;
    const auto found = owner->values.find(IndexOf(valueName));
    if (found == owner->values.end())
        return ERROR_FILE_NOT_FOUND;
    const RegistryValue& value = found->second;
    if (type)
        *type = value.type;
    if (!dataSize)
        return ERROR_SUCCESS;
    const DWORD room = *dataSize;
    *dataSize = static_cast<DWORD>(value.data.size());
    if (!data)
        return ERROR_SUCCESS;
    if (room < value.data.size())
        return ERROR_MORE_DATA;
    std::copy(value.data.begin(), value.data.end(), data);
    return ERROR_SUCCESS;
}

LSTATUS WINAPI RegSetValueExW(HKEY key, LPCWSTR valueName, DWORD reserved, DWORD type,
                              const BYTE* data, DWORD dataSize) {
    const std::wstring index = IndexOf(valueName);
    if (reserved != 0 || index.size() > LongestValueName)
        return ERROR_INVALID_PARAMETER;
    if (!data && dataSize > 0)
        return ERROR_NOACCESS;
    Registry& registry = Registry::Instance();
    const auto lock = registry.Lock();
    std::shared_ptr<RegistryKey> owner;
    if (const LSTATUS resolved = registry.Resolve(key, KEY_SET_VALUE, owner);
        resolved != ERROR_SUCCESS)
        return resolved;
    owner->values[index] = RegistryValue{type, std::vector<BYTE>(data, data + dataSize)};
    return ERROR_SUCCESS;
}

LSTATUS WINAPI RegDeleteValueW(HKEY key, LPCWSTR valueName) {
    Registry& registry = Registry::Instance();
    const auto lock = registry.Lock();
    std::shared_ptr<RegistryKey> owner;
    if (const LSTATUS resolved = registry.Resolve(key, KEY_SET_VALUE, owner);
        resolved != ERROR_SUCCESS)
        return resolved;
    return owner->values.erase(IndexOf(valueName)) > 0 ? ERROR_SUCCESS : ERROR_FILE_NOT_FOUND;
}
