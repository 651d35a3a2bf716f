#pragma once

#include "standins/engine/EngineProcess.h"
#include "standins/engine/Heartbeat.h"
#include "standins/process/Channel.h"
#include "standins/process/Clocks.h"
#include "standins/process/Failure.h"

#include <cstdint>
#include <functional>
#include <string>

namespace standins {

/// The watch over an engine's work on one document, under the two clocks; the engine may be started
/// more than once meanwhile.
class EngineWatch {
public:
    /// @param engine its name, for messages
    /// @param server is told that the work goes on; when it goes, the work is over
    EngineWatch(std::string engine, TimeLimits limits, const Channel& server);

    /// Waits for the engine.
    /// @param bytesWritten answers how much it has written so far
    /// @return no failure when the engine has ended by itself, else why it must be ended
    Failure Await(const EngineProcess& engine, const std::function<std::uint64_t()>& bytesWritten);

private:
    Failure Check(const LifeSign& sign);

    std::string m_engine;
    TimeLimits m_limits;
    Clocks m_clocks;
    const Channel& m_server;
    Heartbeat m_heartbeat;
};

} // namespace standins
