#include "standins/office/engine/Sandbox.h"

#include <seccomp.h>
#include <sys/resource.h>
#include <sys/socket.h>

#include <cerrno>
#include <memory>
#include <thread>

namespace standins {

namespace {

// LibreOffice takes 450 MB of address space for a letter.
constexpr rlim_t MostMemory = rlim_t{4} << 30;
constexpr rlim_t LargestFile = rlim_t{2} << 30;

void Limit(__rlimit_resource resource, rlim_t soft, rlim_t hard) {
    const rlimit limit{soft, hard};
    setrlimit(resource, &limit);
}

} // namespace

void DenyNetwork() {
    const std::unique_ptr<void, decltype(&seccomp_release)> filter(seccomp_init(SCMP_ACT_ALLOW),
                                                                   seccomp_release);
    if (filter && seccomp_rule_add(filter.get(), SCMP_ACT_ERRNO(EACCES), SCMP_SYS(socket), 1,
                                   SCMP_A0(SCMP_CMP_NE, AF_UNIX)) == 0)
        seccomp_load(filter.get());
}

void LimitMemory() {
#ifndef __SANITIZE_ADDRESS__ // whose shadow memory takes terabytes of address space
    Limit(RLIMIT_AS, MostMemory, MostMemory);
#endif
}

void LimitResources(TimeLimits limits) {
    Limit(RLIMIT_CORE, 0, 0);
    Limit(RLIMIT_FSIZE, LargestFile, LargestFile);
    // Every core busy for the whole time: this clock is for an engine that nobody watches.
    const rlim_t cpuSeconds = static_cast<rlim_t>(limits.total.count()) *
                              std::max(1U, std::thread::hardware_concurrency());
    Limit(RLIMIT_CPU, cpuSeconds, cpuSeconds + 1);
}

} // namespace standins
