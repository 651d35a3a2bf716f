#include "host/program/system/StandardFiles.h"

#include "host/program/base/PathText.h"

#include <windows.h>

#include <wx/stdpaths.h>

#include <shlobj.h>

std::filesystem::path UserStateFolder() {
    return FromText(wxStandardPaths::MSWGetShellDir(CSIDL_LOCAL_APPDATA));
}

std::filesystem::path MachineConfiguration() {
    return {};
}
