#include "platform/win32/text/Environment.h"
#include "platform/win32/text/Utf16.h"

#include <wx/msw/registry.h>

#include <vector>

namespace {

struct RootName {
    const char* longName;
    const char* shortName;
    HKEY key;
};

const RootName RootNames[] = {
    {"HKEY_CLASSES_ROOT", "HKCR", HKEY_CLASSES_ROOT},
    {"HKEY_CURRENT_USER", "HKCU", HKEY_CURRENT_USER},
    {"HKEY_LOCAL_MACHINE", "HKLM", HKEY_LOCAL_MACHINE},
    {"HKEY_USERS", "HKU", HKEY_USERS},
};

HKEY RootOf(wxRegKey::StdKey root) {
    switch (root) {
    case wxRegKey::HKCR:
        return HKEY_CLASSES_ROOT;
    case wxRegKey::HKCU:
        return HKEY_CURRENT_USER;
    case wxRegKey::HKLM:
        return HKEY_LOCAL_MACHINE;
    case wxRegKey::HKUSR:
        return HKEY_USERS;
    }
    return nullptr;
}

HKEY RootNamed(const wxString& name) {
    for (const RootName& root : RootNames)
        if (name.IsSameAs(root.longName, false) || name.IsSameAs(root.shortName, false))
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

wxRegKey::wxRegKey(StdKey root, const wxString& path) : m_root(RootOf(root)), m_path(path) {}

wxRegKey::~wxRegKey() {
    Close();
}

bool wxRegKey::Exists() const {
    if (IsOpened())
        return true;
    HKEY key = nullptr;
    if (!m_root || RegOpenKeyExW(m_root, m_path.wc_str(), 0, KEY_READ, &key) != ERROR_SUCCESS)
        return false;
    RegCloseKey(key);
    return true;
}

bool wxRegKey::Open(AccessMode mode) {
    Close();
    const REGSAM access = mode == Read ? KEY_READ : KEY_READ | KEY_WRITE;
    return m_root && RegOpenKeyExW(m_root, m_path.wc_str(), 0, access, &m_key) == ERROR_SUCCESS;
}

bool wxRegKey::Create(bool okIfExists) {
    if (!m_root || (!okIfExists && Exists()))
        return false;
    Close();
    return RegCreateKeyExW(m_root, m_path.wc_str(), 0, nullptr, REG_OPTION_NON_VOLATILE,
                           KEY_READ | KEY_WRITE, nullptr, &m_key, nullptr) == ERROR_SUCCESS;
}

void wxRegKey::Close() {
    if (m_key)
        RegCloseKey(m_key);
    m_key = nullptr;
}

bool wxRegKey::OpenForQuery() const {
    return IsOpened() || const_cast<wxRegKey*>(this)->Open(Read);
}

bool wxRegKey::HasValue(const wxString& name) const {
    return OpenForQuery() && RegQueryValueExW(m_key, ValueName(name), nullptr, nullptr, nullptr,
                                              nullptr) == ERROR_SUCCESS;
}

bool wxRegKey::QueryValue(const wxString& name, wxString& value, bool raw) const {
    DWORD type = REG_NONE;
    DWORD size = 0;
    if (!OpenForQuery() ||
        RegQueryValueExW(m_key, ValueName(name), nullptr, &type, nullptr, &size) != ERROR_SUCCESS)
        return false;
    if (type != REG_SZ && type != REG_EXPAND_SZ)
        return false;
    std::vector<BYTE> bytes(size);
    if (size > 0 && RegQueryValueExW(m_key, ValueName(name), nullptr, nullptr, bytes.data(),
                                     &size) != ERROR_SUCCESS)
        return false;
    const std::wstring text = win32::FromUtf16Bytes(bytes.data(), size);
    value = type == REG_EXPAND_SZ && !raw ? win32::ExpandEnvironment(text) : text;
    return true;
}

bool wxRegKey::QueryValue(const wxString& name, long* value) const {
    DWORD type = REG_NONE;
    DWORD number = 0;
    DWORD size = sizeof number;
    if (!OpenForQuery() ||
        RegQueryValueExW(m_key, ValueName(name), nullptr, &type, reinterpret_cast<BYTE*>(&number),
                         &size) != ERROR_SUCCESS ||
        type != REG_DWORD)
        return false;
    *value = static_cast<long>(number);
    return true;
}

bool wxRegKey::SetValue(const wxString& name, long value) {
    const auto number = static_cast<DWORD>(value);
    return (IsOpened() || Open(Write)) &&
           RegSetValueExW(m_key, ValueName(name), 0, REG_DWORD,
                          reinterpret_cast<const BYTE*>(&number), sizeof number) == ERROR_SUCCESS;
}

bool wxRegKey::SetValue(const wxString& name, const wxString& value) {
    const std::vector<BYTE> bytes = win32::ToUtf16Bytes(value.ToStdWstring());
    return (IsOpened() || Open(Write)) &&
           RegSetValueExW(m_key, ValueName(name), 0, REG_SZ, bytes.data(),
                          static_cast<DWORD>(bytes.size())) == ERROR_SUCCESS;
}

bool wxRegKey::DeleteValue(const wxString& name) {
    return (IsOpened() || Open(Write)) && RegDeleteValueW(m_key, ValueName(name)) == ERROR_SUCCESS;
}

bool wxRegKey::DeleteSelf() {
    Close();
    return m_root && RegDeleteTreeW(m_root, m_path.wc_str()) == ERROR_SUCCESS;
}
