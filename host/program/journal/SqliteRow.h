#pragma once

#include "host/program/journal/Sqlite.h"

// A job as a row of a table of SQLite's.

/// The columns that ReadJob reads.
extern const char* const JobColumns;

/// @param row stands at one with JobColumns
Job ReadJob(SqliteStatement& row);

/// Stores what has changed of a job.
/// @return false when it is gone, or claimed since
bool StoreJob(SqliteDatabase& database, const Job& job, JournalTime now);
