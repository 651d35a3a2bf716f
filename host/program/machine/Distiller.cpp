#include "host/program/machine/Distiller.h"

#include "host/program/machine/Registry.h"

#include <wx/dir.h>
#include <wx/filename.h>

namespace {

constexpr const char* DistillerKey = "SOFTWARE\\Adobe\\Acrobat Distiller\\";
constexpr const char* UserProfilesKey = "SOFTWARE\\Adobe\\PDF Settings";

wxString VersionKey(const char* version) {
    return wxString(DistillerKey) + version;
}

/// The newest Distiller that keeps its job options in a folder of their own, "9.0"; or null.
const char* NewestVersion() {
    for (const char* version : {"9.0", "8.0", "7.0", "6.0"})
        if (wxRegKey(wxRegKey::HKLM, VersionKey(version)).Exists())
            return version;
    return nullptr;
}

wxString JobOptionsFolder() {
    if (const char* const version = NewestVersion())
        return RegisteredText(wxRegKey::HKLM, VersionKey(version), "JobOptionsFolder");
    const wxString settingsKey = VersionKey("AdobePDFSettings");
    if (wxRegKey(wxRegKey::HKCU, settingsKey).Exists())
        return RegisteredText(wxRegKey::HKCU, settingsKey, wxEmptyString);
    const wxString folder = RegisteredText(wxRegKey::HKLM, VersionKey("5.0"), "InstallPath");
    return folder.empty() ? folder : folder + wxFileName::GetPathSeparator() + "Settings";
}

/// The files below the folder, hidden ones too.
template <typename PathArray>
void AppendNames(const wxString& folder, std::vector<wxString>& names) {
    PathArray paths;
    if (!folder.empty() && wxDir::Exists(folder))
        wxDir::GetAllFiles(folder, &paths, wxEmptyString, wxDIR_DEFAULT);
    for (const wxString& path : paths)
        names.push_back(wxFileName(path).GetFullName());
}

} // namespace

std::vector<wxString> ListDistillerProfiles() {
    std::vector<wxString> names;
    AppendNames<wxArrayString>(RegisteredText(wxRegKey::HKCU, UserProfilesKey, wxEmptyString),
                               names);
    AppendNames<wxSortedArrayString>(JobOptionsFolder(), names);
    return names;
}

wxString DistillerEngine() {
    if (wxRegKey(wxRegKey::HKLM, DistillerStandInKey).Exists())
        return RegisteredText(wxRegKey::HKLM, DistillerStandInKey, EngineValue);
    const char* const version = NewestVersion();
    return version ? wxString("Acrobat Distiller ") + version : wxString();
}
