#pragma once

#include "host/program/commands/CommonOptions.h"
#include "host/program/filters/FilterSet.h"
#include "host/program/printing/PrintRun.h"
#include "host/program/report/Reporter.h"

// What `quillon convert --print` does besides converting.

/// Makes what prints a run's output.
/// @param options with a queue
/// @return nothing when that cannot be used so
std::optional<PrintRun> OpenPrintRun(const PrintOptions& options, Fault& fault);

/// Waits until all documents that a print server has are on paper, or never will be, or the run is
/// to end, and tells what has become of each.
/// @param outcomes what does not come out has failed afterwards
/// @return whether none is open
bool AwaitPrints(std::vector<Outcome>& outcomes, const FilterSet& filters, PrintRun& print,
                 Reporter& reporter);
