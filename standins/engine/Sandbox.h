#pragma once

#include "standins/process/Clocks.h"

#include <cstdint>

namespace standins {

// What the calling process, and what it starts, may not do from now on.

/// Leaves it no sockets but local ones: whatever a document makes the engine do, no request goes
/// out. Where the kernel cannot do it, the engine's own settings stand alone.
void DenyNetwork();

/// Lets it start no process. Threads, and another program in its own place, remain.
void DenyProcesses();

/// What an engine may use, in bytes.
struct ResourceLimits {
    std::uint64_t memory = 0; ///< its address space
    std::uint64_t largestFile = std::uint64_t{2} << 30;
};

/// Limits the address space alone, to `most` bytes.
void LimitMemory(std::uint64_t most);

/// The processor time that an engine may use: every core busy for the whole time.
std::uint64_t MostCpuSeconds(TimeLimits times);

/// Limits everything: address space, size of a file, CPU time, no core files. To be followed by
/// exec at once.
void LimitResources(const ResourceLimits& limits, TimeLimits times);

} // namespace standins
