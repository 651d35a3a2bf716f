#pragma once

#include "host/program/documents/OutputFolder.h"
#include "host/program/documents/Screening.h"
#include "host/program/report/Reporter.h"

/// Converts a screened document into the output folder.
/// @param screened accepted by a filter
/// @param baseName the output's name there, without ending
/// @return what came of it
Outcome Convert(const ScreenedInput& screened, const OutputFolder& outputFolder,
                const wxString& baseName, Reporter& reporter);
