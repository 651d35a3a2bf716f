#pragma once

#include "machine/OfficeApplication.h"

// Which Office applications this machine has. Each question reads the registry anew, so that an
// application installed or removed in the meantime is noticed.

/// How far an application is there.
enum class OfficeInstallation {
    None,
    TooOld, ///< only the traces of a Publisher of Office 97 or 2000, which automation cannot drive
    Drivable, ///< by automation
};

OfficeInstallation InstallationOf(OfficeApplication application);

/// Whether the application is there, be it one that cannot be driven.
bool IsInstalled(OfficeApplication application);

/// Whether any of the four applications is there, be it one that cannot be driven.
bool IsOfficeInstalled();

/// The version that the application is registered with: 16 where its versioned name is
/// Word.Application.16.
/// @return 0 when there is none
unsigned long RegisteredVersionOf(OfficeApplication application);

/// Whether the registered version reads the Office Open XML formats: 12 (Office 2007) or later.
bool ReadsOpenXml(OfficeApplication application);
