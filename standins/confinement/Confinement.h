#pragma once

#include <string>
#include <vector>

namespace standins {

/// What is left within reach of a confined process.
struct Reach {
    std::vector<std::string> readable; ///< files, and folders with all that is in them
    std::string workFolder;            ///< where it may do as it likes; empty for nowhere
    std::vector<int> files; ///< open files that it may open anew, to write only if they are so
    std::vector<std::string> socketFolders; ///< where it may make local sockets
    bool mayFork = false; ///< start processes, each of which confines itself once more
};

/// Adds what an ordinary program needs: libraries, what is the same on all machines, the time.
void AllowSystem(Reach& reach);
/// Adds the fonts.
/// @param folders as fontconfig knows them
void AllowFonts(Reach& reach, const std::vector<std::string>& folders);

/// Confines the calling process, and what it runs in its place, for good: it reaches no file but
/// what is said, no network and no other process, and has no rights of the system's administrator.
/// Files that are open stay open. What the kernel cannot do at all is left out; LookAtIsolation
/// tells. Limits on memory, time and the size of files are set apart (ResourceLimits.h),
/// afterwards.
///
/// What a process may not, its children may not either, and what they confine themselves to comes
/// on top of it. So a parent that forks a child for each document is confined before it starts,
/// with mayFork and a work folder that holds those of all children; and each child again, before it
/// reads a byte of its document, to its own folder. That needs no exec.
/// @return false when something else fails, or the process has other threads, which would not be
/// confined; it must do nothing more with a document then
bool Confine(const Reach& reach);

} // namespace standins
