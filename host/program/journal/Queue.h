#pragma once

#include "host/program/journal/Journal.h"

/// Opens a journal that machines share, on a PostgreSQL server. Where the program was built without
/// the library for that, the fault says so.
/// @param url see IsQueueUrl
/// @param fault receives why it cannot be opened
/// @param map how its paths are called on this machine
std::unique_ptr<Journal> OpenQueue(const std::string& url, Fault& fault, JournalNeed need,
                                   const PathMap& map);
