#pragma once

#include <sys/types.h>

namespace standins {

/// Forks a child that is not this process's own but its parent's, who waits for it and whose end is
/// its end if it wishes so. This process must have one thread. Unlike fork, it runs no handlers
/// that libraries have entered for it.
/// @return 0 in the child, its number here; -1 with errno set when there is none
pid_t ForkSibling();

/// @return how many threads this process has
int CountThreads();

} // namespace standins
