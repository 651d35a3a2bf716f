#pragma once

#include "standins/shared/Descriptor.h"

#include <sys/types.h>

#include <cstdint>
#include <string>

namespace standins {

/// @return a descriptor that becomes readable when the process ends (a pidfd); closed, with errno
/// set, when there is none to be had
Descriptor WatchProcess(pid_t process);

/// What the processes of a group use together.
struct GroupUsage {
    std::uint64_t cpuTicks = 0; ///< so far, with what they waited for
    std::uint64_t memory = 0;   ///< now, in bytes; what is shared with others counts by its share
};

/// @return zeros when there is no such group
GroupUsage UsageOfGroup(pid_t group);

/// The memory of a process that is not swapped out, what it shares with others included.
/// @return 0 when there is no such process
std::uint64_t ResidentBytes(pid_t process);

/// Kills the children of the calling process and waits for them, again and again, until none is
/// left. Where orphans fall to the caller (PR_SET_CHILD_SUBREAPER) this ends all its descendants,
/// those that left their process group too.
/// @param spared a child that is left alone, or 0
void EndChildren(pid_t spared = 0);

/// Kills every process of this user whose environment says that `home` is its home folder, and
/// returns when none is left or after a second (a process that the system itself holds).
void EndProcessesAtHome(const std::string& home);

} // namespace standins
