#include "standins/supervisor/Supervisor.h"

#include "standins/confinement/ResourceLimits.h"

#include <sys/prctl.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>

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

/// What the user's environment says is no business of an engine's but the time zone.
void ForgetEnvironment() {
    const char* const zone = std::getenv("TZ");
    const std::string kept = zone ? zone : "";
    clearenv();
    if (zone)
        setenv("TZ", kept.c_str(), 1);
}

} // namespace

void SupervisorOptions::AddTo(CLI::App& options) {
    options.add_option("--folder", folder)->required();
    options.add_option("--fonts", fontFolders, "a folder of fonts")->allow_extra_args(false);
    options.add_option("--stall", stallSeconds)->required();
    options.add_option("--total", totalSeconds)->required();
    options.add_option("--memory", mostMemory)->required();
}

TimeLimits SupervisorOptions::Limits() const {
    return {std::chrono::seconds(stallSeconds), std::chrono::seconds(totalSeconds)};
}

Channel BecomeSupervisor(int given, std::uint64_t mostMemory) {
    IgnoreSignals();
    ForgetEnvironment();
    const auto end = static_cast<unsigned>(FirstGivenDescriptor + given);
    close_range(end, ~0U, 0); // whatever the host left open
    // The engine must not hold the channel: its end would not be seen when the supervisor goes.
    close_range(ChannelDescriptor, end - 1, CLOSE_RANGE_CLOEXEC);
    prctl(PR_SET_CHILD_SUBREAPER, 1); // what the engine starts ends with it
    LimitMemory(mostMemory);
    return Channel(Descriptor(ChannelDescriptor));
}

} // namespace standins
