#pragma once

#include "host/program/Outcome.h"

/// Says one outcome, as a line and as a record.
void Tell(const Outcome& outcome, Reporter& reporter);

/// Says how many files came to what, as a line and as a record of type "summary".
/// @return the command's exit code
ExitCode TellSummary(const std::vector<Outcome>& outcomes, Reporter& reporter);
