#include "machine/FiltersFolder.h"

#include "machine/RegistryText.h"

#include <wx/filename.h>
#include <wx/stdpaths.h>

namespace {

bool IsBuildFolder(const wxString& folder) {
    for (const char* name : {"Release", "Debug", "release", "debug"})
        if (folder.Contains(name))
            return true;
    return false;
}

} // namespace

std::optional<wxString> FindFiltersFolder() {
    const wxString programFolder =
        wxFileName(wxStandardPaths::Get().GetExecutablePath()).GetPath(wxPATH_GET_VOLUME);
    if (IsBuildFolder(programFolder)) // a developer's build has everything in one folder
        return programFolder;
    if (const auto path = ReadRegistryText(wxRegKey::HKLM, HostKey, InstallPathValue))
        return *path + wxFileName::GetPathSeparator() + "Filters";
    return std::nullopt;
}
