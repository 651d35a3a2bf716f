#include "office/InstalledApplications.h"

#include "common/UniqueHandle.h"
#include "office/OfficeApplication.h"

#include <windows.h>

#include <wx/msw/registry.h>
#include <wx/tokenzr.h>

namespace {

constexpr unsigned long FirstOpenXmlVersion = 12;

bool OpenKey(HKEY root, const wchar_t* path, RegistryKeyHandle& key) {
    return RegOpenKeyExW(root, path, 0, KEY_READ, key.Receive()) == ERROR_SUCCESS;
}

bool HasDefaultValue(const RegistryKeyHandle& key) {
    return RegQueryValueExW(key.Get(), nullptr, nullptr, nullptr, nullptr, nullptr) ==
           ERROR_SUCCESS;
}

/// An application is installed when its ProgID is entered with a name. Publisher's case is richer.
bool IsRegistered(OfficeApplication application) {
    RegistryKeyHandle key;
    return OpenKey(HKEY_CLASSES_ROOT, ProgIdOf(application), key) && HasDefaultValue(key);
}

/// The version at the end of a versioned ProgID, 16 in Word.Application.16; 0 when there is none.
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

bool IsOpenXmlVersion(OfficeApplication application) {
    wxRegKey key(wxString("HKEY_CLASSES_ROOT\\") + ProgIdOf(application) + "\\CurVer");
    wxString currentVersion;
    if (!key.Exists() || !key.QueryValue(wxEmptyString, currentVersion))
        return false;
    return VersionIn(currentVersion) >= FirstOpenXmlVersion;
}

} // namespace

bool IsWordInstalled() {
    return IsRegistered(OfficeApplication::Word);
}

bool IsExcelInstalled() {
    return IsRegistered(OfficeApplication::Excel);
}

bool IsPowerPointInstalled() {
    return IsRegistered(OfficeApplication::PowerPoint);
}

int GetPublisherInstallLevel() {
    RegistryKeyHandle key;
    if (OpenKey(HKEY_CLASSES_ROOT, ProgIdOf(OfficeApplication::Publisher), key))
        return HasDefaultValue(key) ? 2 : 0;
    for (const wchar_t* path : {L"SOFTWARE\\Microsoft\\Office\\8.0\\Publisher",
                                L"SOFTWARE\\Microsoft\\Office\\9.0\\Publisher"})
        for (HKEY root : {HKEY_LOCAL_MACHINE, HKEY_CURRENT_USER})
            if (OpenKey(root, path, key))
                return 1;
    return 0;
}

bool IsPublisherInstalled() {
    return GetPublisherInstallLevel() != 0;
}

bool IsOfficeInstalled() {
    return IsWordInstalled() || IsExcelInstalled() || IsPowerPointInstalled() ||
           IsPublisherInstalled();
}

bool IsApplicationInstalledForExtension(const wxString& extension) {
    const auto application = ApplicationForExtension(extension);
    if (!application)
        return false;
    return *application == OfficeApplication::Publisher ? IsPublisherInstalled()
                                                        : IsRegistered(*application);
}

bool IsWord12OrLater() {
    return IsOpenXmlVersion(OfficeApplication::Word);
}

bool IsExcel12OrLater() {
    return IsOpenXmlVersion(OfficeApplication::Excel);
}

bool IsPowerPoint12OrLater() {
    return IsOpenXmlVersion(OfficeApplication::PowerPoint);
}
