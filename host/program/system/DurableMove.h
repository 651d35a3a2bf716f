#pragma once

#include <filesystem>
#include <system_error>

// What is in place and told to be done must be there after a power failure, too. Where a file
// system cannot be asked for that, it is taken at its word.

/// Moves a file within a file system, in place of one that has its new name, when its bytes are on
/// the disk. The move itself is for certain after SyncFolder.
std::error_code MoveDurably(const std::filesystem::path& from, const std::filesystem::path& to);

/// The same, but where a file has the new name already, nothing is moved: std::errc::file_exists.
/// Between two programs that do this to one name, on a file system that can tell, one gets it.
std::error_code MoveWithoutReplacing(const std::filesystem::path& from,
                                     const std::filesystem::path& to);

/// Waits until a file's bytes are on the disk.
std::error_code SyncFile(const std::filesystem::path& file);

/// Waits until the names in a folder are on the disk as they are now.
std::error_code SyncFolder(const std::filesystem::path& folder);
