#pragma once

#include <filesystem>
#include <system_error>

// What is in place and told to be done must be there after a power failure, too. Where a file
// system cannot be asked for that, it is taken at its word.

/// Moves a file within a file system, in place of one that has its new name, when its bytes are on
/// the disk. The move itself is for certain after SyncFolder.
std::error_code MoveDurably(const std::filesystem::path& from, const std::filesystem::path& to);

/// Waits until the names in a folder are on the disk as they are now.
std::error_code SyncFolder(const std::filesystem::path& folder);
