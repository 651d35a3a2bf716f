#pragma once

#include "standins/shared/Clocks.h"

#include <cstdint>
#include <string>
#include <vector>

namespace standins {

/// One PostScript file to turn into PDF. The files are handed over open.
struct DistillerJob {
    std::string program; ///< Ghostscript's full path
    std::string folder;  ///< the work folder, not made yet
    std::vector<std::string> fontFolders;
    TimeLimits limits{};
    std::uint64_t mostMemory = 0; ///< in bytes, all processes together
    int postScript = -1;          ///< open for reading
    int pdf = -1;                 ///< open for writing, empty
    int profile = -1; ///< the job options, open for reading; -1 for Ghostscript's own defaults
};

} // namespace standins
