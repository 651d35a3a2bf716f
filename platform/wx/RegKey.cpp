#include "platform/win32/text/Environment.h"
#include "platform/win32/text/Utf16.h"

#include <wx/msw/registry.h>

#include <vector>

namespace {

/// In the order of StdKey.
const struct {
    const char* name;
    HKEY key;
} Roots[] = {
    {"HKEY_CLASSES_ROOT", HKEY_CLASSES_ROOT},
    {"HKEY_CURRENT_USER", HKEY_CURRENT_USER},
    {"HKEY_LOCAL_MACHINE", HKEY_LOCAL_MACHINE},
};

HKEY RootNamed(const wxString& name) {
    for (const auto& root : Roots)
        if (name == root.name)
            return root.key;
    return nullptr;
}

/// The default value has no name, which the registry functions want as null.
const wchar_t* ValueName(const wxString& name) {
    return name.empty() ? nullptr : name.wc_str();
}

} // namespace

wxRegKey::wxRegKey(const wxString& fullName)
    : m_root(RootNamed(fullName.BeforeFirst('\\'))), m_path(fullName.AfterFirst('\\')) {}

wxRegKey::wxRegKey(StdKey root, const wxString& path) : m_root(Roots[root].key), m_path(path) {}

wxRegKey::~wxRegKey() {
    Close();
}

bool wxRegKey::Exists() const {
    if (m_key)
        return true;
    HKEY key = nullptr;
    if (RegOpenKeyExW(m_root, m_path.wc_str(), 0, KEY_READ, &key) != ERROR_SUCCESS)
        return false;
    RegCloseKey(key);
    return true;
}

bool wxRegKey::Create() {
    Close();
    return RegCreateKeyExW(m_root, m_path.wc_str(), 0, nullptr, REG_OPTION_NON_VOLATILE,
                           KEY_READ | KEY_WRITE, nullptr, &m_key, nullptr) == ERROR_SUCCESS;
}

bool wxRegKey::Open() const {
    return m_key ||
           RegOpenKeyExW(m_root, m_path.wc_str(), 0, KEY_READ | KEY_WRITE, &m_key) == ERROR_SUCCESS;
}

void wxRegKey::Close() {
    if (m_key)
        RegCloseKey(m_key);
    m_key = nullptr;
}

bool wxRegKey::HasValue(const wxString& name) const {
    return Open() && RegQueryValueExW(m_key, ValueName(name), nullptr, nullptr, nullptr, nullptr) ==
                         ERROR_SUCCESS;
}

bool wxRegKey::QueryValue(const wxString& name, wxString& value) const {
    DWORD type = REG_NONE;
    DWORD size = 0;
    if (!Open() ||
        RegQueryValueExW(m_key, ValueName(name), nullptr, &type, nullptr, &size) != ERROR_SUCCESS)
        return false;
    if (type != REG_SZ && type != REG_EXPAND_SZ)
        return false;
    std::vector<BYTE> bytes(size);
    if (size > 0 && RegQueryValueExW(m_key, ValueName(name), nullptr, nullptr, bytes.data(),
                                     &size) != ERROR_SUCCESS)
        return false;
    const std::wstring text = win32::FromUtf16Bytes(bytes.data(), size);
    value = type == REG_EXPAND_SZ ? win32::ExpandEnvironment(text) : text;
    return true;
}

bool wxRegKey::QueryValue(const wxString& name, long* value) const {
    DWORD type = REG_NONE;
    DWORD number = 0;
    DWORD size = sizeof number;
    if (!Open() ||
        RegQueryValueExW(m_key, ValueName(name), nullptr, &type, reinterpret_cast<BYTE*>(&number),
                         &size) != ERROR_SUCCESS ||
        type != REG_DWORD)
        return false;
    *value = static_cast<long>(number);
    return true;
}

bool wxRegKey::SetValue(const wxString& name, long value) {
    const auto number = static_cast<DWORD>(value);
    return Open() &&
           RegSetValueExW(m_key, ValueName(name), 0, REG_DWORD,
                          reinterpret_cast<const BYTE*>(&number), sizeof number) == ERROR_SUCCESS;
}

bool wxRegKey::SetValue(const wxString& name, const wxString& value) {
    const std::vector<BYTE> bytes = win32::ToUtf16Bytes(value.ToStdWstring());
    return Open() && RegSetValueExW(m_key, ValueName(name), 0, REG_SZ, bytes.data(),
                                    static_cast<DWORD>(bytes.size())) == ERROR_SUCCESS;
}

bool wxRegKey::DeleteValue(const wxString& name) {
    if (!Open())
        return false;
    const LSTATUS result = RegDeleteValueW(m_key, ValueName(name));
    return result == ERROR_SUCCESS || result == ERROR_FILE_NOT_FOUND;
}

bool wxRegKey::DeleteSelf() {
    Close();
    return RegDeleteTreeW(m_root, m_path.wc_str()) == ERROR_SUCCESS;
}
