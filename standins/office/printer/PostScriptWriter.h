#pragma once

#include "standins/office/printer/PrintJob.h"

#include <string>

namespace standins {

/// Prints a document as PostScript level 3: text stays text.
/// @param document open for reading, a regular file: a PDF, or for an outline an OpenDocument
/// presentation
/// @param postScript open for writing
/// @return what went wrong; empty when all is written
/// @throws std::runtime_error when the document cannot be read
std::string WritePostScript(int document, int postScript, const PrintJob& job);

} // namespace standins
