#pragma once

#include "host/program/journal/Sqlite.h"

/// Chooses the job that is to be begun, and notes that its folder is served; see Journal::Claim.
/// @return its id; nothing when there is none
std::optional<std::int64_t> ChooseJob(SqliteDatabase& database,
                                      const std::vector<ClaimableFolder>& folders, JournalTime now);
