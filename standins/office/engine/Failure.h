#pragma once

#include "standins/process/Clocks.h"
#include "standins/process/Descriptor.h"

#include <string>

namespace standins {

// Why a document could not be converted, as the end of a sentence that begins with its name:
// "letter.doc cannot be opened: …".

/// @return what, followed by the system's words for the error
std::string DescribeError(const std::string& what, int error);
std::string DescribeStall(const TimeLimits& limits);
std::string DescribeOverdue(const TimeLimits& limits);
/// @param status as waitpid gives it
/// @param folder the work folder
/// @return empty when the engine ended well, as far as its status tells
std::string DescribeStatus(int status, const std::string& folder);
/// Why there is no PDF although the engine ended well: LibreOffice answers success when it failed,
/// and only its log tells more.
std::string DescribeMissingPdf(const std::string& log, const std::string& folder);

/// Opens what the engine made.
/// @return closed when there is no PDF
Descriptor OpenPdf(const std::string& path);

} // namespace standins
