#pragma once

namespace standins {

/// Takes from the calling process, and from what it starts, the system calls that reach beyond it:
/// it makes no connection and no socket but local ones that others must connect to, starts no
/// process and touches none, and changes no file but by writing to it. Threads, and another program
/// in its own place, remain.
/// @param mayFork whether it may start processes and send them signals all the same
/// @return false when that cannot be done
bool DenyCalls(bool mayFork);

} // namespace standins
