#pragma once

#include "host/program/filters/FilterSet.h"
#include "host/program/report/Reporter.h"

/// Says what documents can be converted, as a line and as a record of type "summary", or what is
/// missing, as lines and as records of that type.
/// @param requireIsolation whether documents must be kept from the rest of the machine
/// @return the exit code of a command that asks for it
ExitCode TellReadiness(const FilterSet& filters, bool requireIsolation, Reporter& reporter);
