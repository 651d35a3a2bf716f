#include "standins/inprocess/SupervisorProcess.h"

#include "standins/shared/Text.h"
#include "standins/shared/WorkFolder.h"

#include <windows.h>

#include <fcntl.h>
#include <poll.h>
#include <sys/wait.h>

#include <algorithm>

using namespace std::chrono_literals;

namespace standins {

namespace {

using Time = std::chrono::steady_clock;

/// Waits until something is there to be read, or the other end has gone.
/// @return false when the time is up
bool AwaitReadable(int descriptor, Time::time_point deadline) {
    for (;;) {
        const auto left =
            std::chrono::duration_cast<std::chrono::milliseconds>(deadline - Time::now());
        if (left <= 0ms)
            return false;
        pollfd event{descriptor, POLLIN, 0};
        const int ready = poll(&event, 1, static_cast<int>(std::min<long>(left.count(), 60'000)));
        if (ready > 0)
            return true;
    }
}

/// Why a supervisor that has ended did not do its work to the end.
Failure DescribeLost(const std::string& name, int status, const MemoryShortage& shortage) {
    Failure failure = DescribeEnd(name, status, shortage);
    if (WIFEXITED(status)) // it gave up itself, and not because of a document
        failure = {name + " ended unexpectedly", Fault::Machine};
    return failure;
}

} // namespace

std::optional<SupervisorProcess> SupervisorProcess::Start(const std::string& program,
                                                          const std::vector<std::string>& arguments,
                                                          const std::vector<int>& descriptors) {
    auto ends = Channel::MakePair();
    const Descriptor nothing(open("/dev/null", O_RDWR | O_CLOEXEC));
    if (!ends || !nothing.IsOpen())
        return std::nullopt;
    std::vector<int> given = {nothing.Get(), nothing.Get(), nothing.Get(), ends->second.Socket()};
    given.insert(given.end(), descriptors.begin(), descriptors.end());
    std::optional<ChildProcess> process = ChildProcess::Start(program, arguments, given);
    if (!process)
        return std::nullopt;
    // The supervisor holds the other end alone, so that its end can be seen.
    return SupervisorProcess(std::move(*process), std::move(ends->first));
}

bool SupervisorProcess::Give(const std::string& work, int attachment) const {
    if (!m_channel.Send(MessageKind::Job, work, attachment) ||
        !AwaitReadable(m_channel.Socket(), Time::now() + SupervisorGrace))
        return false;
    pollfd event{m_channel.Socket(), 0, 0};
    return poll(&event, 1, 0) == 0; // it has not gone, which makes the channel readable too
}

std::optional<Message> SupervisorProcess::AwaitResult(const SupervisedRun& run) const {
    const Time::time_point end = Time::now() + run.limits.total + SupervisorGrace;
    while (AwaitReadable(m_channel.Socket(),
                         std::min(end, Time::now() + run.limits.stall + SupervisorGrace))) {
        std::optional<Message> message = m_channel.Receive();
        if (!message)
            return std::nullopt;
        switch (message->kind) {
        case MessageKind::Note:
            OutputDebugStringW(FromUtf8(message->text).c_str());
            break;
        case MessageKind::Part:
            if (run.takePart)
                run.takePart(std::move(*message));
            break;
        case MessageKind::Done:
        case MessageKind::Failed:
            return message;
        default: // it is alive
            break;
        }
    }
    return std::nullopt;
}

Message SupervisorProcess::EndLost(const SupervisedRun& run, const MemoryShortage& shortage) {
    // Its channel closes a little earlier than it ends by itself.
    const bool hasEnded = AwaitReadable(m_process.ExitDescriptor(), Time::now() + 1s);
    m_process.Kill();
    const int status = m_process.Wait();
    WorkFolder::Discard(run.folder, run.clearOutside);
    const std::string name = NameOfSupervisor(run);
    return FailedMessage(hasEnded ? DescribeLost(name, status, shortage)
                                  : Failure{name + " stopped responding"});
}

void SupervisorProcess::Close() {
    m_channel = Channel(Descriptor());
    AwaitReadable(m_process.ExitDescriptor(), Time::now() + SupervisorGrace);
}

void SupervisorProcess::Kill() {
    m_process.Kill();
    m_process.Wait();
}

} // namespace standins
