#include "standins/confinement/ResourceLimits.h"

#include <sys/resource.h>

#include <algorithm>
#include <thread>

namespace standins {

namespace {

void Limit(__rlimit_resource resource, rlim_t soft, rlim_t hard) {
    const rlimit limit{soft, hard};
    setrlimit(resource, &limit);
}

} // namespace

void LimitMemory([[maybe_unused]] std::uint64_t most) {
#ifndef __SANITIZE_ADDRESS__ // whose shadow memory takes terabytes of address space
    constexpr std::uint64_t Unused = std::uint64_t{512} << 20;
    Limit(RLIMIT_AS, most + Unused, most + Unused);
#endif
}

std::uint64_t MostCpuSeconds(TimeLimits times) {
    return static_cast<std::uint64_t>(times.total.count()) *
           std::max(1U, std::thread::hardware_concurrency());
}

void LimitResources(const ResourceLimits& limits, TimeLimits times) {
    Limit(RLIMIT_CORE, 0, 0);
    Limit(RLIMIT_FSIZE, limits.largestFile, limits.largestFile);
    // This clock is for a program that nobody watches.
    const rlim_t cpuSeconds = MostCpuSeconds(times);
    Limit(RLIMIT_CPU, cpuSeconds, cpuSeconds + 1);
    LimitMemory(limits.memory);
}

} // namespace standins
