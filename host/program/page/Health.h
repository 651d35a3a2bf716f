#pragma once

#include "host/program/page/JournalAccess.h"
#include "host/program/report/Texts.h"
#include "host/program/watch/WatchStatus.h"

/// Whether a folder, or all of them, are paused by a person.
/// @param folder its name; empty for all
bool IsPaused(const wxString& folder, const WatchStatus& status, const JournalExtract& journal);

/// Why a watch does not do all that it should, for people.
/// @return nothing when it does
std::vector<wxString> ReasonsOfIllness(const WatchStatus& status, const JournalExtract& journal,
                                       std::chrono::steady_clock::time_point now,
                                       const Texts& texts);
