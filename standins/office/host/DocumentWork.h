#pragma once

#include "standins/confinement/Confinement.h"
#include "standins/office/shared/HostOrder.h"
#include "standins/shared/Descriptor.h"

#include <sys/types.h>

namespace standins {

/// All of a child's life: it becomes an engine like others, in the work folder, in a process group
/// of its own, dies with its supervisor and reaches nothing else; it does the work and ends.
/// @param log where its messages go
/// @param supervisor its parent
/// @param reach its own, but for the work folder
[[noreturn]] void DoWork(const HostOrder& order, const Descriptor& log, pid_t supervisor,
                         Reach reach);

} // namespace standins
