#pragma once

#include "host/program/OutputFolder.h"
#include "host/program/Reporter.h"
#include "host/program/Screening.h"

/// Converts a screened document into the output folder.
/// @param screened accepted by a filter
/// @param baseName the output's name there, without ending
/// @return what came of it
Outcome Convert(const ScreenedInput& screened, const OutputFolder& outputFolder,
                const wxString& baseName, Reporter& reporter);
