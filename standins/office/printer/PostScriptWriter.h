#pragma once

#include "standins/office/printer/PostScriptOutput.h"
#include "standins/office/printer/PrintJob.h"
#include "standins/shared/Failure.h"

namespace standins {

/// Prints a document as PostScript level 3: text stays text.
/// @param document open for reading, a regular file: a PDF, or for an outline an OpenDocument
/// presentation
/// @param output new, and finished afterwards
/// @return no failure when all is written
/// @throws std::runtime_error when the document cannot be read
Failure WritePostScript(int document, PostScriptOutput& output, const PrintJob& job);

} // namespace standins
