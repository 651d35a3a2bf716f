#pragma once

#include "host/program/documents/Inputs.h"
#include "host/program/documents/Outcome.h"
#include "host/program/filters/FilterSet.h"

#include <memory>

/// One file after screening.
struct ScreenedInput {
    Outcome outcome;
    Filter* filter = nullptr;      ///< the one that accepted it
    std::unique_ptr<JobItem> item; ///< null when no filter did
};

/// Looks whether the file can be converted, first itself, then by the filter that claims it.
ScreenedInput Screen(const FilterSet& filters, const Input& input);

/// Screens a file that is not to be converted now. One that its filter accepts, but whose
/// application is not there, is refused as its conversion would be.
Outcome ScreenOnly(const FilterSet& filters, const Input& input);

/// Says in the outcome that the file's turn did not come.
Outcome NotReached(const FilterSet& filters, const Input& input);

/// What files with the extension need and this machine lacks, and what to do; for outcomes with a
/// code of the machine's.
wxString MachineReason(const wxString& extension);
