#pragma once

#include "standins/shared/Channel.h"
#include "standins/shared/Clocks.h"
#include "standins/shared/Failure.h"
#include "standins/shared/ProcessTable.h"
#include "standins/supervisor/EngineProcess.h"
#include "standins/supervisor/Heartbeat.h"

#include <cstdint>
#include <functional>
#include <string>

namespace standins {

/// The watch over an engine's work on one document, under the two clocks and
/// the limit on memory; the engine may be started
/// more than once meanwhile.
class EngineWatch {
public:
    /// @param engine its name, for messages
    /// @param mostMemory of all its processes together, in bytes
    /// @param server is told that the work goes on; when it goes, the work is over
    EngineWatch(std::string engine, TimeLimits limits, std::uint64_t mostMemory,
                const Channel& server);

    /// The engine's name.
    const std::string& Engine() const { return m_engine; }

    /// Waits for the engine.
    /// @param bytesWritten answers how much it has written so far
    /// @return no failure when the engine has ended by itself, else why it must be ended
    Failure Await(const EngineProcess& engine, const std::function<std::uint64_t()>& bytesWritten);

private:
    Failure Check(const GroupUsage& usage, std::uint64_t bytesWritten);

    std::string m_engine;
    TimeLimits m_limits;
    std::uint64_t m_mostMemory;
    Clocks m_clocks;
    const Channel& m_server;
    Heartbeat m_heartbeat;
};

} // namespace standins
