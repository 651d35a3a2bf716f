#pragma once

#include <windows.h>

#include <optional>
#include <string>

namespace standins {

/// An open registry key.
class RegistryKey {
public:
    /// Opens a key for reading; IsOpen() tells whether it exists.
    static RegistryKey Open(HKEY root, const std::wstring& path);
    /// Opens a key for writing, and makes it where it does not exist.
    static RegistryKey Create(HKEY root, const std::wstring& path);

    RegistryKey(RegistryKey&& other) noexcept;
    RegistryKey& operator=(RegistryKey&&) = delete;
    ~RegistryKey();

    bool IsOpen() const { return m_key != nullptr; }

    // A null name is the key's default value.

    std::optional<std::wstring> Text(LPCWSTR name) const;
    std::optional<DWORD> Number(LPCWSTR name) const;
    bool SetText(LPCWSTR name, const std::wstring& text) const;
    void Delete(LPCWSTR name) const;

private:
    explicit RegistryKey(HKEY key) : m_key(key) {}

    HKEY m_key;
};

} // namespace standins
