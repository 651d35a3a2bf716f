#pragma once

#include "standins/process/Descriptor.h"

#include <string>

namespace standins {

/// Opens what the engine made.
/// @return closed when there is no PDF
Descriptor OpenPdf(const std::string& path);

/// Why there is no PDF although the engine ended well: LibreOffice answers success when it failed,
/// and only its log tells more.
std::string DescribeMissingPdf(const std::string& log);

} // namespace standins
