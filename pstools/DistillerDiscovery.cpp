#include "pstools/DistillerDiscovery.h"

#include "common/UniqueHandle.h"

#include <windows.h>

#include <wx/dir.h>
#include <wx/filename.h>
#include <wx/log.h>
#include <wx/msw/registry.h>
#include <wx/stdpaths.h>
#include <wx/strconv.h>

#include <optional>

namespace {

constexpr char InstallationKey[] = "SOFTWARE\\Orvanta\\Marlo Quillon";
constexpr char UserProfilesKey[] = "SOFTWARE\\Adobe\\PDF Settings";

const wchar_t* const DistillerKeys[] = {
    L"SOFTWARE\\Adobe\\Acrobat Distiller\\9.0",
    L"SOFTWARE\\Adobe\\Acrobat Distiller\\8.0",
    L"SOFTWARE\\Adobe\\Acrobat Distiller\\7.0",
    L"SOFTWARE\\Adobe\\Acrobat Distiller\\6.0",
};
constexpr wchar_t SettingsKey[] = L"SOFTWARE\\Adobe\\Acrobat Distiller\\AdobePDFSettings";
constexpr wchar_t Distiller5Key[] = L"SOFTWARE\\Adobe\\Acrobat Distiller\\5.0";

/// Reads a value through wxWidgets, which fills in the environment's variables.
std::optional<wxString> ReadValue(wxRegKey::StdKey root, const char* path, const char* name) {
    const wxLogNull missingKeysAreNoErrors;
    wxString value;
    const wxRegKey key(root, path);
    if (!key.Exists() || !key.HasValue(name) || !key.QueryValue(name, value))
        return std::nullopt;
    return value;
}

bool OpenKey(HKEY root, const wchar_t* path, RegistryKeyHandle& key) {
    return RegOpenKeyExW(root, path, 0, KEY_READ, key.Receive()) == ERROR_SUCCESS;
}

/// Reads a path of at most MAX_PATH characters; a longer one is none.
std::optional<wxString> ReadPath(const RegistryKeyHandle& key, const wchar_t* name) {
    constexpr DWORD BytesPerCharacter = 2; // UTF-16 in the registry, on every system
    char buffer[MAX_PATH * BytesPerCharacter] = {};
    DWORD size = sizeof buffer;
    if (RegQueryValueExW(key.Get(), name, nullptr, nullptr, reinterpret_cast<BYTE*>(buffer),
                         &size) != ERROR_SUCCESS)
        return std::nullopt;
    const wxString text(buffer, wxMBConvUTF16LE(), size);
    return text.BeforeFirst(L'\0');
}

std::optional<wxString> ReadJobOptionsFolder() {
    RegistryKeyHandle key;
    for (const wchar_t* path : DistillerKeys)
        if (OpenKey(HKEY_LOCAL_MACHINE, path, key))
            return ReadPath(key, L"JobOptionsFolder"); // the newest counts, whatever it says
    if (OpenKey(HKEY_CURRENT_USER, SettingsKey, key))
        return ReadPath(key, nullptr);
    return std::nullopt;
}

bool IsBuildFolder(const wxString& folder) {
    for (const char* name : {"Release", "Debug", "release", "debug"})
        if (folder.Contains(name))
            return true;
    return false;
}

/// Lists all files below a folder, hidden ones included, with their full paths.
template <typename PathArray>
PathArray FilesBelow(const wxString& folder) {
    PathArray files;
    if (!folder.empty() && wxDir::Exists(folder))
        wxDir::GetAllFiles(folder, &files, wxEmptyString, wxDIR_DEFAULT);
    return files;
}

void AppendNames(const wxArrayString& paths, wxArrayString& names) {
    for (const wxString& path : paths)
        names.Add(wxFileName(path).GetFullName());
}

} // namespace

void GetFiltersFolder(wxString& folder) {
    const wxString programFolder =
        wxFileName(wxStandardPaths::Get().GetExecutablePath()).GetPath(wxPATH_GET_VOLUME);
    if (IsBuildFolder(programFolder)) // a developer's build has everything in one folder
        folder = programFolder;
    else if (const auto path = ReadValue(wxRegKey::HKLM, InstallationKey, "InstallPath"))
        folder = *path + wxFileName::GetPathSeparator() + "Filters";
}

void GetJobOptionsFolder(wxString& folder) {
    if (const auto path = ReadJobOptionsFolder()) {
        folder = *path;
        return;
    }
    RegistryKeyHandle key;
    if (!OpenKey(HKEY_LOCAL_MACHINE, Distiller5Key, key))
        return;
    const wxString separator = wxFileName::GetPathSeparator();
    if (const auto path = ReadPath(key, L"InstallPath"))
        folder = *path + separator + "Settings" + separator;
}

void GetDistillerProfiles(wxArrayString& profiles) {
    wxString jobOptionsFolder;
    GetJobOptionsFolder(jobOptionsFolder);
    const wxString userFolder = ReadValue(wxRegKey::HKCU, UserProfilesKey, "").value_or("");
    AppendNames(FilesBelow<wxArrayString>(userFolder), profiles);
    AppendNames(FilesBelow<wxSortedArrayString>(jobOptionsFolder), profiles);
}
