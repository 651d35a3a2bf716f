#include "host/program/system/StandardFiles.h"

#include "host/program/base/PathText.h"

#include <wx/utils.h>

#include <cstdlib>

namespace fs = std::filesystem;

fs::path UserStateFolder() {
    const char* const given = std::getenv("XDG_STATE_HOME");
    const fs::path folder = given ? given : "";
    // One that is relative means nothing.
    return folder.is_absolute() ? folder : FromText(wxGetHomeDir()) / ".local" / "state";
}

fs::path MachineConfiguration() {
    return "/etc/quillon/watch.toml";
}
