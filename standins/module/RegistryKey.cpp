#include "standins/module/RegistryKey.h"

#include "standins/module/Text.h"

#include <glib.h>

#include <memory>
#include <utility>
#include <vector>

namespace standins {

namespace {

/// Texts of the registry are UTF-16 with a terminating zero.
std::vector<BYTE> RegistryBytes(const std::wstring& text) {
    const std::string utf8 = ToUtf8(text).value_or(std::string());
    glong length = 0;
    const std::unique_ptr<gunichar2, decltype(&g_free)> units(
        g_utf8_to_utf16(utf8.c_str(), -1, nullptr, &length, nullptr), g_free);
    const auto* bytes = reinterpret_cast<const BYTE*>(units.get());
    return {bytes, bytes + (static_cast<std::size_t>(length) + 1) * sizeof(gunichar2)};
}

std::wstring FromRegistryBytes(const std::vector<BYTE>& bytes) {
    const std::unique_ptr<char, decltype(&g_free)> utf8(
        g_utf16_to_utf8(reinterpret_cast<const gunichar2*>(bytes.data()),
                        static_cast<glong>(bytes.size() / sizeof(gunichar2)), nullptr, nullptr,
                        nullptr),
        g_free);
    return utf8 ? FromUtf8(utf8.get()) : std::wstring();
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
    std::vector<BYTE> bytes(size);
    if (RegQueryValueExW(m_key, name, nullptr, &type, bytes.data(), &size) != ERROR_SUCCESS)
        return std::nullopt;
    return FromRegistryBytes(bytes);
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
    const std::vector<BYTE> bytes = RegistryBytes(text);
    return m_key && RegSetValueExW(m_key, name, 0, REG_SZ, bytes.data(),
                                   static_cast<DWORD>(bytes.size())) == ERROR_SUCCESS;
}

void RegistryKey::Delete(LPCWSTR name) const {
    if (m_key)
        RegDeleteValueW(m_key, name);
}

} // namespace standins
