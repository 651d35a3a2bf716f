#pragma once

#include <filesystem>

/// Whether a folder's files lie on another machine, or in another program's hands: then the system
/// tells of no change that is not made here, and does not know who writes.
bool IsShare(const std::filesystem::path& folder);

/// Whether somebody has a file open for writing.
enum class Writers {
    None,
    Some,
    Unknown, ///< not this user's file, or on a file system that cannot tell
};

/// Neither waits for anybody nor follows a link.
Writers AskForWriters(const std::filesystem::path& file);

/// Of which files AskForWriters can tell.
enum class WritersKnown {
    OfAll,
    OfOwn,  ///< those of the user that this process runs as
    OfNone, ///< the file system cannot tell
};

/// Leaves no trace in the folder.
WritersKnown WritersKnownIn(const std::filesystem::path& folder);
