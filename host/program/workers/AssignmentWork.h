#pragma once

#include "host/program/filters/FilterSet.h"
#include "host/program/workers/Messages.h"
#include "plugin/interface/ProgressSink.h"

/// Does what an assignment asks for, with the filters set as it says: makes its workplace, converts
/// the file, or copies it, and waits until the output is on the disk.
/// @return with State::Changed when the file is not the one that was meant, or is no more
Outcome ConvertAssignment(const Assignment& work, const FilterSet& filters, ProgressSink& progress);
