#include "standins/engine/Supervisor.h"

#include "standins/engine/Sandbox.h"

#include <sys/prctl.h>
#include <unistd.h>

#include <csignal>

namespace standins {

namespace {

constexpr int ChannelDescriptor = FirstGivenDescriptor - 1;

/// Whoever wants to end the supervisor ends the server: then the channel closes, and the
/// supervisor can still clear away what the engine has made. A file that becomes too large is a
/// write that fails.
void IgnoreSignals() {
    for (const int number : {SIGHUP, SIGINT, SIGQUIT, SIGTERM, SIGPIPE, SIGALRM, SIGXFSZ})
        signal(number, SIG_IGN);
}

} // namespace

void SupervisorOptions::AddTo(CLI::App& options) {
    options.add_option("--folder", folder)->required();
    options.add_option("--stall", stallSeconds)->required();
    options.add_option("--total", totalSeconds)->required();
}

TimeLimits SupervisorOptions::Limits() const {
    return {std::chrono::seconds(stallSeconds), std::chrono::seconds(totalSeconds)};
}

Channel BecomeSupervisor(int given, [[maybe_unused]] std::uint64_t mostMemory) {
    IgnoreSignals();
    const auto end = static_cast<unsigned>(FirstGivenDescriptor + given);
    close_range(end, ~0U, 0); // whatever the host left open
    // The engine must not hold the channel: its end would not be seen when the supervisor goes.
    close_range(ChannelDescriptor, end - 1, CLOSE_RANGE_CLOEXEC);
    prctl(PR_SET_CHILD_SUBREAPER, 1); // what the engine starts ends with it
#ifndef __SANITIZE_ADDRESS__          // whose shadow memory takes terabytes of address space
    LimitMemory(mostMemory);
#endif
    return Channel(Descriptor(ChannelDescriptor));
}

} // namespace standins
