#include "machine/RegistryText.h"

#include <wx/log.h>
#include <wx/strconv.h>

RegistryKeyHandle OpenRegistryKey(HKEY root, const wxString& path) {
    RegistryKeyHandle key;
    if (RegOpenKeyExW(root, path.wc_str(), 0, KEY_READ, key.Receive()) != ERROR_SUCCESS)
        return {};
    return key;
}

bool HasDefaultValue(const RegistryKeyHandle& key) {
    return RegQueryValueExW(key.Get(), nullptr, nullptr, nullptr, nullptr, nullptr) ==
           ERROR_SUCCESS;
}

std::optional<wxString> ReadRegistryPath(const RegistryKeyHandle& key, const wchar_t* name) {
    constexpr DWORD BytesPerCharacter = 2; // UTF-16 in the registry, on every system
    char buffer[MAX_PATH * BytesPerCharacter] = {};
    DWORD size = sizeof buffer;
    if (RegQueryValueExW(key.Get(), name, nullptr, nullptr, reinterpret_cast<BYTE*>(buffer),
                         &size) != ERROR_SUCCESS)
        return std::nullopt;
    const wxString text(buffer, wxMBConvUTF16LE(), size);
    return text.BeforeFirst(L'\0');
}

std::optional<wxString> ReadRegistryText(wxRegKey::StdKey root, const wxString& path,
                                         const wxString& name) {
    const wxLogNull missingKeysAreNoErrors; // wxWidgets would show them in a window
    wxString value;
    const wxRegKey key(root, path);
    if (!key.Exists() || !key.HasValue(name) || !key.QueryValue(name, value))
        return std::nullopt;
    return value;
}
