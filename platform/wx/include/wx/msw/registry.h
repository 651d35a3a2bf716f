#pragma once

// wxWidgets' registry key class, which it has on Windows only, on top of the registry functions.

#include <windows.h>

#include <wx/string.h>

/// A registry key by its full name, for instance "HKEY_CURRENT_USER\Software\Marlo". Opens itself
/// when a value is asked for; closes itself when destroyed.
class wxRegKey {
public:
    enum StdKey { HKCR, HKCU, HKLM };

    /// @param fullName root key and path, separated by backslashes
    explicit wxRegKey(const wxString& fullName);
    wxRegKey(StdKey root, const wxString& path);
    ~wxRegKey();
    wxRegKey(const wxRegKey&) = delete;
    wxRegKey& operator=(const wxRegKey&) = delete;

    bool Exists() const;
    /// Makes the key if need be.
    bool Create();

    bool HasValue(const wxString& name) const;
    /// Reads a text; one of the expandable type has its %NAME% parts replaced from the environment.
    /// An empty name is the key's default value.
    bool QueryValue(const wxString& name, wxString& value) const;
    bool QueryValue(const wxString& name, long* value) const;
    bool SetValue(const wxString& name, long value);
    bool SetValue(const wxString& name, const wxString& value);
    /// A value that is not there is no failure.
    bool DeleteValue(const wxString& name);
    bool DeleteSelf();

private:
    bool Open() const;
    void Close();

    HKEY m_root;
    wxString m_path;
    mutable HKEY m_key = nullptr;
};
