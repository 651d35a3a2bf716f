#pragma once

#include "standins/office/process/Clocks.h"

namespace standins {

/// Leaves the calling process, and what it starts, no sockets but local ones: whatever a document
/// makes LibreOffice do, no request goes out. Where the kernel cannot do it, LibreOffice's own
/// setting against links stands alone.
void DenyNetwork();

/// Limits what the calling process may use: memory, CPU time, size of a file, no core files.
void LimitResources(TimeLimits limits);

} // namespace standins
