#pragma once

#include "host/program/documents/Inputs.h"
#include "host/program/documents/Outcome.h"
#include "host/program/documents/OutputFolder.h"
#include "host/program/filters/FilterSet.h"
#include "plugin/interface/ProgressSink.h"

/// Screens a file and, if a filter accepts it, converts it into the output folder.
/// @param baseName the output's name there, without ending
/// @return what came of it, with the time that it took
Outcome ConvertInput(const Input& input, const wxString& baseName, const FilterSet& filters,
                     const OutputFolder& outputFolder, ProgressSink& progress);
