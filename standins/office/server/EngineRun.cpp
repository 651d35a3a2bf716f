#include "standins/office/server/EngineRun.h"

#include "standins/module/Text.h"
#include "standins/office/server/Module.h"
#include "standins/office/server/Settings.h"
#include "standins/process/Channel.h"
#include "standins/process/ChildProcess.h"
#include "standins/process/ProcessTable.h"
#include "standins/process/WorkFolder.h"

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

EngineResult Failure(const std::string& reason) {
    return {Descriptor(), {}, FromUtf8(reason)};
}

std::vector<std::string> SupervisorArguments(const std::string& program,
                                             const DocumentFormat& format,
                                             const std::string& folder, const TimeLimits& limits) {
    return {
        "--program=" + program,
        "--folder=" + folder,
        std::string("--extension=") + format.extension,
        std::string("--import=") + format.importFilter,
        std::string("--export=") + format.exportFilter,
        "--stall=" + std::to_string(limits.stall.count()),
        "--total=" + std::to_string(limits.total.count()),
    };
}

EngineResult CannotStart(int error) {
    return Failure("LibreOffice's supervisor cannot be started: " +
                   std::generic_category().message(error));
}

std::optional<ChildProcess> StartSupervisor(const std::vector<std::string>& arguments,
                                            const Channel& channel, const DocumentFile& document) {
    const Descriptor nothing(open("/dev/null", O_RDWR | O_CLOEXEC));
    if (!nothing.IsOpen())
        return std::nullopt;
    return ChildProcess::Start(
        HelperPath("office-engine"), arguments,
        {nothing.Get(), nothing.Get(), nothing.Get(), channel.Socket(), document.descriptor.Get()});
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
/// @param lost receives why there is none
std::optional<Message> AwaitResult(const Channel& channel, const TimeLimits& limits,
                                   std::string& lost) {
    const Time::time_point end = Time::now() + limits.total + Grace;
    while (WaitForMessage(channel, std::min(end, Time::now() + limits.stall + Grace))) {
        std::optional<Message> message = channel.Receive();
        if (!message)
            lost = "LibreOffice's supervisor ended unexpectedly";
        if (!message || message->kind != MessageKind::Alive)
            return message;
    }
    lost = "LibreOffice's supervisor stopped responding";
    return std::nullopt;
}

/// After a supervisor that did not do its work to the end. Its engine dies with it.
void ClearAfter(ChildProcess& supervisor, const std::string& folder) {
    supervisor.Kill();
    supervisor.Wait();
    EndProcessesAtHome(folder);
    WorkFolder::Remove(folder);
}

} // namespace

EngineResult RunEngine(const DocumentFile& document, const DocumentFormat& format) {
    const std::string program = ReadEnginePath();
    if (program.empty())
        return Failure("LibreOffice is not installed");
    const TimeLimits limits = ReadTimeLimits();
    const std::string folder = WorkFolder::NewPath();
    auto ends = Channel::MakePair();
    if (!ends)
        return CannotStart(errno);
    std::optional<ChildProcess> supervisor = StartSupervisor(
        SupervisorArguments(program, format, folder, limits), ends->second, document);
    if (!supervisor)
        return CannotStart(errno);
    const Channel channel = std::move(ends->first);
    ends.reset(); // the supervisor holds the other end alone, so that its end can be seen

    std::string lost;
    std::optional<Message> result = AwaitResult(channel, limits, lost);
    if (!result) {
        ClearAfter(*supervisor, folder);
        return Failure(lost);
    }
    if (result->kind != MessageKind::Done || !result->attachment.IsOpen())
        return Failure(result->text);
    return {std::move(result->attachment), result->text, {}};
}

} // namespace standins
