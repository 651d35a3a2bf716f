#pragma once

#include "standins/office/printer/PrintJob.h"

#include <string>

namespace standins {

/// Prints a PDF as PostScript level 3: text stays text, each page has the size and the orientation
/// in which a viewer shows it.
/// @param pdf open for reading, a regular file
/// @param postScript open for writing
/// @return what went wrong; empty when all is written
std::string WritePostScript(int pdf, int postScript, const PrintJob& job);

} // namespace standins
