#include "office/InstalledApplications.h"

#include "machine/InstalledOffice.h"

bool IsWordInstalled() {
    return IsInstalled(OfficeApplication::Word);
}

bool IsExcelInstalled() {
    return IsInstalled(OfficeApplication::Excel);
}

bool IsPowerPointInstalled() {
    return IsInstalled(OfficeApplication::PowerPoint);
}

int GetPublisherInstallLevel() {
    switch (InstallationOf(OfficeApplication::Publisher)) {
    case OfficeInstallation::TooOld:
        return 1;
    case OfficeInstallation::Drivable:
        return 2;
    default:
        return 0;
    }
}

bool IsPublisherInstalled() {
    return GetPublisherInstallLevel() != 0;
}

bool IsApplicationInstalledForExtension(const wxString& extension) {
    const auto application = ApplicationForExtension(extension);
    return application && IsInstalled(*application);
}

bool IsWord12OrLater() {
    return ReadsOpenXml(OfficeApplication::Word);
}

bool IsExcel12OrLater() {
    return ReadsOpenXml(OfficeApplication::Excel);
}

bool IsPowerPoint12OrLater() {
    return ReadsOpenXml(OfficeApplication::PowerPoint);
}
