#pragma once

#include "standins/inprocess/SupervisedRun.h"
#include "standins/shared/Channel.h"
#include "standins/shared/ChildProcess.h"
#include "standins/shared/ProcessEnd.h"

#include <chrono>
#include <optional>
#include <string>
#include <vector>

namespace standins {

/// What a supervisor gets to do its own clearing up before it counts as lost.
constexpr std::chrono::seconds SupervisorGrace{5};

/// A supervisor at work, as whoever started it sees it. Killed when the object goes.
class SupervisorProcess {
public:
    /// @param program the supervisor's full path
    /// @param descriptors what it is handed beside the channel
    /// @return nothing when it cannot be started; errno tells why
    static std::optional<SupervisorProcess> Start(const std::string& program,
                                                  const std::vector<std::string>& arguments,
                                                  const std::vector<int>& descriptors);

    /// Gives work to a supervisor that takes some.
    /// @return whether it shows a sign of life; what it says remains to be read
    bool Give(const std::string& work, int attachment) const;

    /// Waits for the result. The supervisor says that it is alive in between; the total time counts
    /// from now on, as it does there.
    /// @return nothing when there is none: the supervisor has ended, or does not respond
    std::optional<Message> AwaitResult(const SupervisedRun& run) const;

    /// Ends a supervisor that did not bring a run to its end, and its engine with it, and clears
    /// away what is left of the run.
    /// @return the run's failure
    Message EndLost(const SupervisedRun& run, const MemoryShortage& shortage);

    /// Lets it end by itself, as it does when nobody is there any more, and gives it time for that.
    void Close();
    /// Ends it, and the engine with it.
    void Kill();

private:
    SupervisorProcess(ChildProcess process, Channel channel)
        : m_process(std::move(process)), m_channel(std::move(channel)) {}

    ChildProcess m_process;
    Channel m_channel;
};

} // namespace standins
