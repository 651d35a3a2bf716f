#pragma once

#include "standins/shared/Clocks.h"

#include <cstdint>

namespace standins {

/// What a program may use that works on a document, in bytes.
struct ResourceLimits {
    std::uint64_t memory = 0;
    std::uint64_t largestFile = std::uint64_t{2} << 30;
};

/// Limits the address space of the calling process, and of each that it starts: to `most` bytes and
/// half a GiB more, since libraries take addresses without using the memory. Bounds what is taken
/// between two looks at the memory in use.
void LimitMemory(std::uint64_t most);

/// The processor time that a program may use: every core busy for the whole time.
std::uint64_t MostCpuSeconds(TimeLimits times);

/// Limits everything: address space, size of a file, CPU time, no core files. To be called last:
/// memory that others want afterwards counts too.
void LimitResources(const ResourceLimits& limits, TimeLimits times);

} // namespace standins
