#include "host/program/ProgramFolder.h"

#include "host/program/PathText.h"

#include <wx/stdpaths.h>

std::filesystem::path ProgramFolder() {
    return FromText(wxStandardPaths::Get().GetExecutablePath()).parent_path();
}
