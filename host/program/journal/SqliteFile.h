#pragma once

#include "host/program/journal/Sqlite.h"

/// Opens the file of a journal, whose tables it has then.
/// @param need what becomes of one that is not there, or damaged
/// @param isDamaged whether that is known of it already
/// @param fault receives why it cannot be opened
std::unique_ptr<SqliteDatabase> OpenJournalFile(const std::filesystem::path& file, JournalNeed need,
                                                bool isDamaged, std::chrono::milliseconds patience,
                                                Fault& fault);
