#include "machine/InstalledOffice.h"

#include "machine/RegistryText.h"

#include <wx/tokenzr.h>

#include <algorithm>
#include <iterator>

namespace {

constexpr unsigned long FirstOpenXmlVersion = 12;

bool HasOldPublisher() {
    for (const char* path : {"SOFTWARE\\Microsoft\\Office\\8.0\\Publisher",
                             "SOFTWARE\\Microsoft\\Office\\9.0\\Publisher"})
        for (HKEY root : {HKEY_LOCAL_MACHINE, HKEY_CURRENT_USER})
            if (OpenRegistryKey(root, path))
                return true;
    return false;
}

/// The number at the end of a versioned ProgID; 0 when there is none.
unsigned long VersionIn(const wxString& versionedProgId) {
    wxString last;
    wxStringTokenizer tokens(versionedProgId, ".");
    while (tokens.HasMoreTokens())
        last = tokens.GetNextToken();

    // ToULong would take a sign, and "-3" for a huge number.
    unsigned long version = 0;
    if (last.find_first_of("0123456789") == 0)
        last.ToULong(&version);
    return version;
}

} // namespace

OfficeInstallation InstallationOf(OfficeApplication application) {
    // A key without a name is what some uninstallers leave. It hides an old Publisher, too.
    if (const RegistryKeyHandle key = OpenRegistryKey(HKEY_CLASSES_ROOT, ProgIdOf(application)))
        return HasDefaultValue(key) ? OfficeInstallation::Drivable : OfficeInstallation::None;
    return application == OfficeApplication::Publisher && HasOldPublisher()
               ? OfficeInstallation::TooOld
               : OfficeInstallation::None;
}

bool IsInstalled(OfficeApplication application) {
    return InstallationOf(application) != OfficeInstallation::None;
}

bool IsOfficeInstalled() {
    return std::any_of(std::begin(AllOfficeApplications), std::end(AllOfficeApplications),
                       IsInstalled);
}

unsigned long RegisteredVersionOf(OfficeApplication application) {
    return VersionIn(
        ReadRegistryText(wxRegKey::HKCR, wxString(ProgIdOf(application)) + "\\CurVer", "")
            .value_or(wxString()));
}

bool ReadsOpenXml(OfficeApplication application) {
    return RegisteredVersionOf(application) >= FirstOpenXmlVersion;
}
