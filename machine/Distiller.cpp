#include "machine/Distiller.h"

#include "machine/RegistryText.h"

#include <wx/dir.h>
#include <wx/filename.h>

namespace {

constexpr char UserProfilesKey[] = "SOFTWARE\\Adobe\\PDF Settings";

wxString KeyOf(const char* version) {
    return wxString("SOFTWARE\\Adobe\\Acrobat Distiller\\") + version;
}

/// The newest Distiller that keeps its profiles in a folder of its own choice.
std::optional<Distiller> FindDistiller6OrLater() {
    for (const char* version : {"9.0", "8.0", "7.0", "6.0"})
        if (const RegistryKeyHandle key = OpenRegistryKey(HKEY_LOCAL_MACHINE, KeyOf(version)))
            return Distiller{version, ReadRegistryPath(key, L"JobOptionsFolder")};
    if (const RegistryKeyHandle key = OpenRegistryKey(HKEY_CURRENT_USER, KeyOf("AdobePDFSettings")))
        return Distiller{{}, ReadRegistryPath(key, nullptr)};
    return std::nullopt;
}

/// It keeps them where it is installed.
std::optional<Distiller> FindDistiller5() {
    constexpr char Version[] = "5.0";
    const RegistryKeyHandle key = OpenRegistryKey(HKEY_LOCAL_MACHINE, KeyOf(Version));
    if (!key)
        return std::nullopt;
    Distiller distiller{Version, ReadRegistryPath(key, L"InstallPath")};
    const wxString separator = wxFileName::GetPathSeparator();
    if (distiller.jobOptionsFolder)
        *distiller.jobOptionsFolder += separator + "Settings" + separator;
    return distiller;
}

/// Appends the names of all files below a folder, hidden ones included.
template <typename PathArray>
void AppendNames(const wxString& folder, std::vector<wxString>& names) {
    PathArray paths;
    if (!folder.empty() && wxDir::Exists(folder))
        wxDir::GetAllFiles(folder, &paths, wxEmptyString, wxDIR_DEFAULT);
    for (const wxString& path : paths)
        names.push_back(wxFileName(path).GetFullName());
}

} // namespace

std::optional<Distiller> FindDistiller() {
    std::optional<Distiller> newest = FindDistiller6OrLater();
    if (newest && newest->jobOptionsFolder)
        return newest;
    std::optional<Distiller> oldest = FindDistiller5();
    if (newest && oldest) // one that has not said where its profiles lie takes the old ones
        oldest->version = newest->version;
    return oldest ? oldest : newest;
}

wxString UserProfilesFolder() {
    return ReadRegistryText(wxRegKey::HKCU, UserProfilesKey, "").value_or(wxString());
}

std::vector<wxString> ListDistillerProfiles() {
    std::vector<wxString> names;
    AppendNames<wxArrayString>(UserProfilesFolder(), names);
    const std::optional<Distiller> distiller = FindDistiller();
    if (distiller && distiller->jobOptionsFolder)
        AppendNames<wxSortedArrayString>(*distiller->jobOptionsFolder, names);
    return names;
}
