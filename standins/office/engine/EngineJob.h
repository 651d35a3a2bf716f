#pragma once

#include "standins/process/Clocks.h"

#include <string>

namespace standins {

/// One document to turn into PDF.
struct EngineJob {
    std::string program;      ///< LibreOffice's program folder
    std::string folder;       ///< the work folder, not made yet
    std::string extension;    ///< of the document, without a dot
    std::string importFilter; ///< LibreOffice's name of the document's type
    std::string exportFilter; ///< LibreOffice's PDF filter, with options in JSON if any
    TimeLimits limits{};
};

} // namespace standins
