#include "host/program/base/ProgramFiles.h"

#include "host/program/base/PathText.h"

#include <wx/stdpaths.h>

#include <algorithm>

namespace fs = std::filesystem;

fs::path ProgramFile() {
    return FromText(wxStandardPaths::Get().GetExecutablePath());
}

fs::path ProgramFolder() {
    return ProgramFile().parent_path();
}

std::vector<fs::path> ModuleFiles(const fs::path& folder) {
    std::vector<fs::path> files;
    std::error_code error;
    for (fs::directory_iterator entry(folder, error), end; !error && entry != end;
         entry.increment(error)) {
        std::error_code unreadable;
        if (entry->path().extension() == QUILLON_MODULE_SUFFIX &&
            entry->is_regular_file(unreadable) && IsText(entry->path()))
            files.push_back(entry->path());
    }
    std::sort(files.begin(), files.end());
    return files;
}
