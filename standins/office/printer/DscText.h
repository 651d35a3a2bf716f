#pragma once

#include <string>

namespace standins {

/// A text as the value of a PostScript document comment: in ASCII, on one line, shortened so that
/// it fits. What is not ASCII stands as UTF-16 with a byte order mark, in octal, which Ghostscript
/// reads back into a PDF's title (only without parentheses around it).
/// @param text UTF-8
std::string DscText(const std::string& text);

} // namespace standins
