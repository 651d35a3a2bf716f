#pragma once

#include "host/program/filters/FilterSet.h"
#include "host/program/report/Reporter.h"

#include <optional>

/// Whether there is no filter at all, without which no document can be looked at.
std::optional<Fault> FindMissingFilter(const FilterSet& filters);

/// Extensions of documents that there is no application for on this machine.
std::set<std::string> FindUnopenable(const FilterSet& filters);

/// What is missing to convert documents at all, or to make PDF files of them.
/// @param requireIsolation whether documents must be kept from the rest of the machine
std::vector<Fault> FindMissing(const FilterSet& filters, bool requireIsolation);

/// Says what documents can be converted, as a line and as a record of type "summary", or what is
/// missing, as lines and as records of that type.
/// @param requireIsolation as above
/// @return the exit code of a command that asks for it
ExitCode TellReadiness(const FilterSet& filters, bool requireIsolation, Reporter& reporter);
