#pragma once

#include "host/program/documents/Inputs.h"
#include "host/program/documents/Outcome.h"
#include "host/program/filters/FilterSet.h"
#include "plugin/interface/ProgressSink.h"

/// Screens a file and, if a filter accepts it, makes its output in a workplace.
/// @param workplace a folder that is there, and has no output in it
/// @return what came of it, with the time that it took; when it is converted, its output is to be
///     delivered
Outcome ConvertInput(const Input& input, const FilterSet& filters,
                     const std::filesystem::path& workplace, ProgressSink& progress);
