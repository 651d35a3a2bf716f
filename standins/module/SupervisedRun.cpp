#include "standins/module/SupervisedRun.h"

#include "standins/process/ChildProcess.h"

#include <fcntl.h>
#include <poll.h>

#include <algorithm>
#include <cerrno>
#include <system_error>

using namespace std::chrono_literals;

namespace standins {

namespace {

using Time = std::chrono::steady_clock;

// What the supervisor gets to do its own clearing up before it counts as lost.
constexpr std::chrono::seconds Grace = 5s;

Message Failure(const SupervisedRun& run, const std::string& what) {
    return {MessageKind::Failed, run.engine + "'s supervisor " + what, Descriptor()};
}

Message CannotStart(const SupervisedRun& run, int error) {
    return Failure(run, "cannot be started: " + std::generic_category().message(error));
}

std::optional<ChildProcess> StartSupervisor(const SupervisedRun& run, const Channel& channel) {
    const Descriptor nothing(open("/dev/null", O_RDWR | O_CLOEXEC));
    if (!nothing.IsOpen())
        return std::nullopt;
    std::vector<std::string> arguments = {
        "--folder=" + run.folder,
        "--stall=" + std::to_string(run.limits.stall.count()),
        "--total=" + std::to_string(run.limits.total.count()),
    };
    arguments.insert(arguments.end(), run.arguments.begin(), run.arguments.end());
    std::vector<int> descriptors = {nothing.Get(), nothing.Get(), nothing.Get(), channel.Socket()};
    descriptors.insert(descriptors.end(), run.descriptors.begin(), run.descriptors.end());
    return ChildProcess::Start(run.supervisor, arguments, descriptors);
}

/// Waits until a message is there, or the other end has gone.
/// @return false when the time is up
bool WaitForMessage(const Channel& channel, Time::time_point deadline) {
    for (;;) {
        const auto left =
            std::chrono::duration_cast<std::chrono::milliseconds>(deadline - Time::now());
        if (left <= 0ms)
            return false;
        pollfd event{channel.Socket(), POLLIN, 0};
        const int ready = poll(&event, 1, static_cast<int>(std::min<long>(left.count(), 60'000)));
        if (ready > 0)
            return true;
    }
}

/// The supervisor's last message. It says that it is alive in between; the total time counts from
/// the start, as it does there.
/// @param lost receives what happened when there is none
std::optional<Message> AwaitResult(const Channel& channel, const TimeLimits& limits,
                                   std::string& lost) {
    const Time::time_point end = Time::now() + limits.total + Grace;
    while (WaitForMessage(channel, std::min(end, Time::now() + limits.stall + Grace))) {
        std::optional<Message> message = channel.Receive();
        if (!message)
            lost = "ended unexpectedly";
        if (!message || message->kind != MessageKind::Alive)
            return message;
    }
    lost = "stopped responding";
    return std::nullopt;
}

/// After a supervisor that did not do its work to the end. Its engine dies with it.
void ClearAfter(ChildProcess& supervisor, const SupervisedRun& run) {
    supervisor.Kill();
    supervisor.Wait();
    WorkFolder::Discard(run.folder, run.clearOutside);
}

} // namespace

Message RunSupervised(const SupervisedRun& run) {
    auto ends = Channel::MakePair();
    if (!ends)
        return CannotStart(run, errno);
    std::optional<ChildProcess> supervisor = StartSupervisor(run, ends->second);
    if (!supervisor)
        return CannotStart(run, errno);
    const Channel channel = std::move(ends->first);
    ends.reset(); // the supervisor holds the other end alone, so that its end can be seen

    std::string lost;
    std::optional<Message> result = AwaitResult(channel, run.limits, lost);
    if (result)
        return std::move(*result);
    ClearAfter(*supervisor, run);
    return Failure(run, lost);
}

} // namespace standins
