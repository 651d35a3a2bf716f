#include "standins/module/SupervisedRun.h"

#include "standins/module/FontFolders.h"
#include "standins/process/ChildProcess.h"
#include "standins/process/ProcessEnd.h"

#include <fcntl.h>
#include <poll.h>
#include <sys/wait.h>

#include <algorithm>
#include <cerrno>

using namespace std::chrono_literals;

namespace standins {

namespace {

using Time = std::chrono::steady_clock;

// What the supervisor gets to do its own clearing up before it counts as lost.
constexpr std::chrono::seconds Grace = 5s;

Message Failed(Failure failure) {
    return {MessageKind::Failed, std::move(failure.reason), Descriptor(), failure.fault};
}

std::string NameOfSupervisor(const SupervisedRun& run) {
    return run.engine + "'s supervisor";
}

std::optional<ChildProcess> StartSupervisor(const SupervisedRun& run, const Channel& channel) {
    const Descriptor nothing(open("/dev/null", O_RDWR | O_CLOEXEC));
    if (!nothing.IsOpen())
        return std::nullopt;
    std::vector<std::string> arguments = {
        "--folder=" + run.folder,
        "--stall=" + std::to_string(run.limits.stall.count()),
        "--total=" + std::to_string(run.limits.total.count()),
        "--memory=" + std::to_string(run.mostMemory),
    };
    for (const std::string& folder : FontFolders())
        arguments.push_back("--fonts=" + folder);
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
/// @return nothing when there is none: the supervisor has ended, or does not respond
std::optional<Message> AwaitResult(const Channel& channel, const TimeLimits& limits) {
    const Time::time_point end = Time::now() + limits.total + Grace;
    while (WaitForMessage(channel, std::min(end, Time::now() + limits.stall + Grace))) {
        std::optional<Message> message = channel.Receive();
        if (!message || message->kind != MessageKind::Alive)
            return message;
    }
    return std::nullopt;
}

/// Whether a process ends by itself within a moment; its channel closes a little earlier.
bool HasEnded(const ChildProcess& process) {
    constexpr int Moment = 1000; // milliseconds
    pollfd event{process.ExitDescriptor(), POLLIN, 0};
    return poll(&event, 1, Moment) > 0;
}

/// Why a supervisor that has ended did not do its work to the end.
Failure DescribeLost(const std::string& name, int status, const MemoryShortage& shortage) {
    Failure failure = DescribeEnd(name, status, shortage);
    if (WIFEXITED(status)) // it gave up itself, and not because of a document
        failure = {name + " ended unexpectedly", Fault::Machine};
    return failure;
}

/// After a supervisor that did not do its work to the end. Its engine dies with it.
Failure ClearAfter(ChildProcess& supervisor, const SupervisedRun& run,
                   const MemoryShortage& shortage) {
    const bool hasEnded = HasEnded(supervisor);
    supervisor.Kill();
    const int status = supervisor.Wait();
    WorkFolder::Discard(run.folder, run.clearOutside);
    return hasEnded ? DescribeLost(NameOfSupervisor(run), status, shortage)
                    : Failure{NameOfSupervisor(run) + " stopped responding"};
}

} // namespace

Message RunSupervised(const SupervisedRun& run) {
    const MemoryShortage shortage;
    auto ends = Channel::MakePair();
    std::optional<ChildProcess> supervisor =
        ends ? StartSupervisor(run, ends->second) : std::nullopt;
    if (!supervisor)
        return Failed(MachineFailure(NameOfSupervisor(run) + " cannot be started", errno));
    const Channel channel = std::move(ends->first);
    ends.reset(); // the supervisor holds the other end alone, so that its end can be seen

    std::optional<Message> result = AwaitResult(channel, run.limits);
    return result ? std::move(*result) : Failed(ClearAfter(*supervisor, run, shortage));
}

} // namespace standins
