#pragma once

#include "host/program/journal/Job.h"

// PDF for a queue that prints nothing else as it is, where a folder's settings ask for PostScript
// alone.

/// Has a PDF file made beside the PostScript.
/// @param settings as XML
/// @return whether they did not ask for it
bool AskForPdf(std::string& settings);

/// Puts the PDF where only the printer gets it from, and has the PostScript delivered.
/// @param job Submitting
void SetPdfAside(Job& job);
