#pragma once

#include "common/WQServices.h"

#include <filesystem>
#include <string_view>

/// Where log records go. The host decides it, at its start and before it has threads; filters only
/// write records. Until then records from LevelWarning on go to stderr.
namespace Log {

/// Sends the records of all levels to the end of a file, and none to stderr any more.
/// @return whether the file could be opened; if not, nothing has changed
bool ToFile(const std::filesystem::path& path);

/// Sends the records from `level` on to stderr, whether or not there is a file too.
void ToStandardError(SeverityLevel level);

/// Whether a record of this level goes anywhere.
bool Wants(int level);

/// Hands on a finished record.
/// @param line UTF-8, with its line feed
void Write(int level, std::string_view line);

} // namespace Log
