#pragma once

#include "standins/shared/Descriptor.h"

#include <string>

namespace standins {

/// Opens what the engine made.
/// @return closed when there is none: no PDF, no package, whichever its extension says
Descriptor OpenOutput(const std::string& path);

/// Why there is none although the engine ended well: LibreOffice answers success when it failed,
/// and only its log tells more.
std::string DescribeMissingOutput(const std::string& log);

} // namespace standins
