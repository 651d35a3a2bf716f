#pragma once

#include "host/program/base/ExitCode.h"
#include "host/program/documents/Inputs.h"
#include "host/program/documents/Outcome.h"
#include "host/program/filters/FilterSet.h"
#include "host/program/report/Reporter.h"

#include <optional>
#include <vector>

/// Says one outcome, as a line and as a record.
void Tell(const Outcome& outcome, Reporter& reporter);

/// Says what has become of a file on a print server, as a line and as a record of type "print".
/// @param outcome with a job
/// @param isOver whether nothing comes of it any more
/// @param message what the server says of it
void TellPrint(const Outcome& outcome, bool isOver, const wxString& message, Reporter& reporter);

/// Says how many files came to what, as a line and as a record of type "summary".
/// @param wasInterrupted whether there was more to do
/// @return the command's exit code
ExitCode TellSummary(const std::vector<Outcome>& outcomes, Reporter& reporter,
                     bool wasInterrupted = false);

/// Ends a run whose filters or arguments leave nothing to do, saying so.
/// @param inputs what the arguments mean
/// @return the exit code to end with, or nothing when there is work
std::optional<ExitCode> EndIdleRun(const FilterSet& filters, const std::vector<Input>& inputs,
                                   Reporter& reporter);
