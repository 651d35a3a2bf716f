#pragma once

#include "standins/shared/Channel.h"
#include "standins/shared/Clocks.h"
#include "standins/shared/WorkFolder.h"

#include <functional>
#include <string>
#include <vector>

namespace standins {

/// An engine to be run under a supervisor.
struct SupervisedRun {
    std::string engine;                 ///< its name, for messages
    std::string supervisor;             ///< the supervisor's full path
    std::vector<std::string> arguments; ///< beside those that every supervisor gets
    std::vector<int> descriptors;       ///< what is handed to it, in its order
    std::string folder;                 ///< the work folder, not made yet
    WorkFolder::ClearOutside clearOutside = nullptr;
    TimeLimits limits{};
    std::uint64_t mostMemory = 0;          ///< in bytes
    std::function<void(Message)> takePart; ///< takes the parts of the result that come ahead of it
};

/// Runs it, and returns when nothing of the run is left: no process, no file. The supervisor sees
/// to it that the engine ends; that the supervisor itself ends is seen to here.
/// @return a message Done, or Failed with the reason as the end of a sentence
Message RunSupervised(const SupervisedRun& run);

// What its ways share.

/// What the supervisor is told.
std::vector<std::string> SupervisorArguments(const SupervisedRun& run);
std::string NameOfSupervisor(const SupervisedRun& run);
Message FailedMessage(Failure failure);

} // namespace standins
