#pragma once

#include <string>
#include <vector>

namespace standins {

/// What the PPD of a print server's queue says of its paper, as options of the program that writes
/// the PostScript: sizes and their printable areas.
/// @return empty for other printers, of which that is not known; they take any size
std::vector<std::string> PaperOptions(const std::wstring& printer);

} // namespace standins
