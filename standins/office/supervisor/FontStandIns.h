#pragma once

#include <string>

namespace standins {

/// Which fonts a document asks for and what LibreOffice has set in their place, as it has told in
/// its work folder.
/// @return for each a line with the font asked for, a tab and the other; UTF-8
std::string ReadFontStandIns(const std::string& folder);

} // namespace standins
