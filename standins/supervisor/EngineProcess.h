#pragma once

#include "standins/confinement/Confinement.h"
#include "standins/confinement/ResourceLimits.h"
#include "standins/shared/Clocks.h"
#include "standins/shared/Descriptor.h"

#include <sys/resource.h>
#include <sys/types.h>

#include <string>
#include <vector>

namespace standins {

/// A program to be run as an engine.
struct EngineCommand {
    std::vector<std::string> words; ///< the program's full path and its arguments
    std::vector<std::string> environment;
    std::string folder;           ///< where it runs
    std::vector<int> descriptors; ///< what it gets as descriptors 0, 1, 2 and so on, and no others
    TimeLimits times{};
    ResourceLimits resources;
    Reach reach; ///< its files are told by the numbers that the engine knows them under
};

/// The environment of an engine whose home and temporary files are in `folder`.
std::vector<std::string> EngineEnvironment(const std::string& folder);

/// The exit code, as a shell has it, of an engine that could not be started.
constexpr int EngineCannotStart = 127;
/// That of one that could not be confined.
constexpr int EngineNotConfined = 126;

/// An engine at work: confined, in a process group of its own, with limits on what it may use,
/// without the caller's environment. It dies with the caller.
class EngineProcess {
public:
    /// Starts it. The caller must have a single thread.
    explicit EngineProcess(const EngineCommand& command);
    /// Takes over a child of the caller that another process has forked. IsStarted() tells whether
    /// there is such a child.
    /// @param times those of its command
    static EngineProcess Adopt(pid_t child, TimeLimits times);

    bool IsStarted() const { return m_exit.IsOpen(); }
    pid_t Group() const { return m_id; }
    /// Becomes readable when the engine has ended.
    int ExitDescriptor() const { return m_exit.Get(); }
    /// Ends the engine if it has not ended, with everything that it started.
    /// @param spared another child of the caller that is left alone, or 0
    /// @return the status as waitpid gives it; SIGXCPU, too, where the system has ended it for its
    /// processor time in the way that cannot be ignored
    int End(pid_t spared = 0);

private:
    explicit EngineProcess(TimeLimits times);

    pid_t m_id = -1;
    rlim_t m_mostCpuSeconds;
    Descriptor m_exit; ///< a pidfd
};

} // namespace standins
