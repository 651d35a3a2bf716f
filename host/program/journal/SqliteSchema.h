#pragma once

#include "host/program/journal/Sqlite.h"

/// Sees to it that an open file has a journal's tables, in a form that this version knows.
/// @param file its path, for the fault
/// @param make the tables when the file is empty
/// @param fault receives why they are not there
bool EnsureSchema(SqliteDatabase& database, const std::filesystem::path& file, bool make,
                  Fault& fault);
