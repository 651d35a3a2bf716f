#include "standins/inprocess/RegistryKey.h"

#include "standins/shared/Text.h"

#include <utility>

namespace standins {

namespace {

/// Texts of the registry are UTF-16 with a terminating zero.
std::u16string RegistryUnits(const std::wstring& text) {
    return ToUtf16(ToUtf8(text).value_or(std::string())) + u'\0';
}

std::wstring FromRegistryUnits(const std::u16string& units) {
    return FromUtf8(FromUtf16(units).value_or(std::string()));
}

} // namespace

RegistryKey RegistryKey::Open(HKEY root, const std::wstring& path) {
    HKEY key = nullptr;
    if (RegOpenKeyExW(root, path.c_str(), 0, KEY_READ, &key) != ERROR_SUCCESS)
        key = nullptr;
    return RegistryKey(key);
}

RegistryKey RegistryKey::Create(HKEY root, const std::wstring& path) {
    HKEY key = nullptr;
    if (RegCreateKeyExW(root, path.c_str(), 0, nullptr, REG_OPTION_NON_VOLATILE,
                        KEY_READ | KEY_WRITE, nullptr, &key, nullptr) != ERROR_SUCCESS)
        key = nullptr;
    return RegistryKey(key);
}

RegistryKey::RegistryKey(RegistryKey&& other) noexcept
    : m_key(std::exchange(other.m_key, nullptr)) {}

RegistryKey::~RegistryKey() {
    if (m_key)
        RegCloseKey(m_key);
}

std::optional<std::wstring> RegistryKey::Text(LPCWSTR name) const {
    DWORD type = REG_NONE;
    DWORD size = 0;
    if (!m_key || RegQueryValueExW(m_key, name, nullptr, &type, nullptr, &size) != ERROR_SUCCESS ||
        type != REG_SZ)
        return std::nullopt;
    std::u16string units((size + 1) / sizeof(char16_t), u'\0');
    if (RegQueryValueExW(m_key, name, nullptr, &type, reinterpret_cast<BYTE*>(units.data()),
                         &size) != ERROR_SUCCESS)
        return std::nullopt;
    units.resize(size / sizeof(char16_t));
    return FromRegistryUnits(units);
}

std::optional<DWORD> RegistryKey::Number(LPCWSTR name) const {
    DWORD type = REG_NONE;
    DWORD number = 0;
    DWORD size = sizeof number;
    if (!m_key ||
        RegQueryValueExW(m_key, name, nullptr, &type, reinterpret_cast<BYTE*>(&number), &size) !=
            ERROR_SUCCESS ||
        type != REG_DWORD)
        return std::nullopt;
    return number;
}

bool RegistryKey::SetText(LPCWSTR name, const std::wstring& text) const {
    const std::u16string units = RegistryUnits(text);
    return m_key &&
           RegSetValueExW(m_key, name, 0, REG_SZ, reinterpret_cast<const BYTE*>(units.data()),
                          static_cast<DWORD>(units.size() * sizeof(char16_t))) == ERROR_SUCCESS;
}

void RegistryKey::Delete(LPCWSTR name) const {
    if (m_key)
        RegDeleteValueW(m_key, name);
}

} // namespace standins
