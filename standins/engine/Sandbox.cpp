#include "standins/engine/Sandbox.h"

#include <sched.h>
#include <seccomp.h>
#include <sys/resource.h>
#include <sys/socket.h>

#include <cerrno>
#include <memory>
#include <thread>

namespace standins {

namespace {

using Filter = std::unique_ptr<void, decltype(&seccomp_release)>;

Filter AllowEverything() {
    return Filter(seccomp_init(SCMP_ACT_ALLOW), seccomp_release);
}

void Limit(__rlimit_resource resource, rlim_t soft, rlim_t hard) {
    const rlimit limit{soft, hard};
    setrlimit(resource, &limit);
}

} // namespace

void DenyNetwork() {
    const Filter filter = AllowEverything();
    if (filter && seccomp_rule_add(filter.get(), SCMP_ACT_ERRNO(EACCES), SCMP_SYS(socket), 1,
                                   SCMP_A0(SCMP_CMP_NE, AF_UNIX)) == 0)
        seccomp_load(filter.get());
}

void DenyProcesses() {
    const Filter filter = AllowEverything();
    // The flags of clone3 are out of a filter's reach; the C library then falls back to clone.
    if (filter &&
        seccomp_rule_add(filter.get(), SCMP_ACT_ERRNO(ENOSYS), SCMP_SYS(clone3), 0) == 0 &&
        seccomp_rule_add(filter.get(), SCMP_ACT_ERRNO(EACCES), SCMP_SYS(clone), 1,
                         SCMP_A0(SCMP_CMP_MASKED_EQ, CLONE_THREAD, 0)) == 0 &&
        seccomp_rule_add(filter.get(), SCMP_ACT_ERRNO(EACCES), SCMP_SYS(fork), 0) == 0 &&
        seccomp_rule_add(filter.get(), SCMP_ACT_ERRNO(EACCES), SCMP_SYS(vfork), 0) == 0)
        seccomp_load(filter.get());
}

void LimitMemory(std::uint64_t most) {
    Limit(RLIMIT_AS, most, most);
}

std::uint64_t MostCpuSeconds(TimeLimits times) {
    return static_cast<std::uint64_t>(times.total.count()) *
           std::max(1U, std::thread::hardware_concurrency());
}

void LimitResources(const ResourceLimits& limits, TimeLimits times) {
    Limit(RLIMIT_CORE, 0, 0);
    Limit(RLIMIT_FSIZE, limits.largestFile, limits.largestFile);
    // This clock is for an engine that nobody watches.
    const rlim_t cpuSeconds = MostCpuSeconds(times);
    Limit(RLIMIT_CPU, cpuSeconds, cpuSeconds + 1);
    LimitMemory(limits.memory); // at last: the memory that others want here counts too
}

} // namespace standins
