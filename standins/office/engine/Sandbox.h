#pragma once

#include "standins/process/Clocks.h"

namespace standins {

/// Leaves the calling process, and what it starts, no sockets but local ones: whatever a document
/// makes LibreOffice do, no request goes out. Where the kernel cannot do it, LibreOffice's own
/// setting against links stands alone.
void DenyNetwork();

/// Limits the memory of the calling process and of what it starts.
void LimitMemory();

/// Limits what else the calling process may use: CPU time, size of a file, no core files.
void LimitResources(TimeLimits limits);

} // namespace standins
