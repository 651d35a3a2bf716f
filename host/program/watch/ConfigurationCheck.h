#pragma once

#include "host/program/filters/FilterSet.h"
#include "host/program/report/Reporter.h"
#include "host/program/watch/WatchConfiguration.h"

/// Says what a watch with the configuration would do, as lines and as records of type "folder", and
/// what is in its way at the moment, as lines and as records of type "problem"; at last a record of
/// type "summary". Nothing is made or changed.
/// @param problems those that somebody else has found
/// @return 0, or 3 when there are problems
ExitCode TellCheck(const WatchConfiguration& configuration, const FilterSet& filters,
                   Reporter& reporter, const std::vector<Fault>& problems = {});
