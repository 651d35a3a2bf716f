#pragma once

#include "standins/shared/Clocks.h"

#include <cstdint>
#include <string>
#include <vector>

namespace standins {

/// One document to turn into something else.
struct EngineJob {
    std::string program;      ///< LibreOffice's program folder
    std::string folder;       ///< the work folder, not made yet
    std::string knownPath;    ///< the document's own; empty when it has none that is UTF-8
    std::string extension;    ///< of the document, without a dot
    std::string importFilter; ///< LibreOffice's name of the document's type
    std::string exportTo;     ///< extension, colon, LibreOffice's filter with options if any
    std::string hiddenTo; ///< like exportTo, with hidden slides; empty when that is not asked for
    std::vector<std::string> fontFolders;
    TimeLimits limits{};
    std::uint64_t mostMemory = 0; ///< in bytes, all processes together
};

} // namespace standins
