#pragma once

#include <string>

namespace standins {

/// What this system has to keep engines from all that is not theirs.
struct Isolation {
    std::string means;   ///< by their names: "Landlock 7, seccomp"
    std::string missing; ///< what is not there, and why: as a sentence without its end; empty when
                         ///< nothing is missing
};

/// Asks the kernel.
Isolation LookAtIsolation();

/// @return the version of Landlock that the kernel has; 0, with errno set, when it has none
int LandlockVersion();

/// Whether the kernel filters system calls; if not, errno tells why.
bool HasCallFilters();

} // namespace standins
