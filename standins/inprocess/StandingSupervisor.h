#pragma once

#include "standins/inprocess/SupervisedRun.h"
#include "standins/inprocess/SupervisorProcess.h"

#include <optional>
#include <string>
#include <vector>

namespace standins {

/// A supervisor that does one run after the other, and keeps for the next one what takes long to
/// make. For one thread at a time.
class StandingSupervisor {
public:
    StandingSupervisor() = default;
    /// Waits until nothing is left of it.
    ~StandingSupervisor();
    StandingSupervisor(const StandingSupervisor&) = delete;
    StandingSupervisor& operator=(const StandingSupervisor&) = delete;

    /// Runs an engine as RunSupervised does.
    /// @param keep the arguments that make the supervisor a standing one, beside those that every
    /// supervisor gets; when they or the limits are others than before, it is started
    /// anew
    /// @param kind of engine, for the name of the work folder of what is kept
    /// @return nothing when there is no such supervisor to be had and the run has not begun
    std::optional<Message> Run(const SupervisedRun& run, const std::vector<std::string>& keep,
                               const std::string& kind);

private:
    bool Start(const SupervisedRun& run, const std::vector<std::string>& keep,
               const std::string& kind);
    void Kill();
    void Kill(const SupervisedRun& run);

    std::optional<SupervisorProcess> m_process;
    std::vector<std::string> m_kept; ///< what it was told, but for the folder
    std::string m_home;              ///< the work folder of what it keeps
};

} // namespace standins
