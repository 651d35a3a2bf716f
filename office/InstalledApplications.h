#pragma once

#include <wx/string.h>

// Which Office applications this machine has. Each question reads the registry anew, so that an
// application installed or removed while the filter is loaded is noticed.

bool IsWordInstalled();
bool IsExcelInstalled();
bool IsPowerPointInstalled();

/// @return 0 none; 1 only the traces of an old Publisher (Office 97 or 2000), which automation
/// cannot drive; 2 a Publisher to work with
int GetPublisherInstallLevel();

/// Whether there is any Publisher, be it one that cannot be driven.
bool IsPublisherInstalled();

/// @param extension without the dot, in any case
/// @return false also for an extension that no application serves
bool IsApplicationInstalledForExtension(const wxString& extension);

// Whether the registered version is 12 (Office 2007), the first to read the Office Open XML
// formats, or a later one.

bool IsWord12OrLater();
bool IsExcel12OrLater();
bool IsPowerPoint12OrLater();
