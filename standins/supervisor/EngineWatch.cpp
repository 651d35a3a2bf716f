#include "standins/supervisor/EngineWatch.h"

#include "standins/supervisor/EngineFailure.h"

#include <poll.h>

#include <array>
#include <cerrno>

namespace standins {

namespace {

constexpr std::uint64_t MostBytes = std::uint64_t{4} << 30; // in all files together

} // namespace

EngineWatch::EngineWatch(std::string engine, TimeLimits limits, std::uint64_t mostMemory,
                         const Channel& server)
    : m_engine(std::move(engine)), m_limits(limits), m_mostMemory(mostMemory), m_clocks(limits),
      m_server(server), m_heartbeat(server) {}

Failure EngineWatch::Await(const EngineProcess& engine,
                           const std::function<std::uint64_t()>& bytesWritten) {
    for (;;) {
        std::array<pollfd, 2> events{
            {{engine.ExitDescriptor(), POLLIN, 0}, {m_server.Socket(), POLLIN, 0}}};
        const int ready =
            poll(events.data(), events.size(), static_cast<int>(m_clocks.Interval().count()));
        if (ready < 0 && errno != EINTR)
            return MachineFailure(m_engine + " cannot be watched", errno);
        if (events[1].revents != 0)
            return {"nobody waits for it any more", Fault::Outside};
        if (events[0].revents != 0)
            return {};
        Failure ended = Check(UsageOfGroup(engine.Group()), bytesWritten());
        if (ended)
            return ended;
    }
}

Failure EngineWatch::Check(const GroupUsage& usage, std::uint64_t bytesWritten) {
    if (usage.memory > m_mostMemory)
        return MemoryFailure(m_engine, m_mostMemory);
    if (bytesWritten > MostBytes)
        return {m_engine + " wrote more than it may"};
    switch (m_clocks.Check({usage.cpuTicks, bytesWritten})) {
    case Clocks::State::Stalled:
        return StallFailure(m_engine, m_limits);
    case Clocks::State::Overdue:
        return OverdueFailure(m_engine, m_limits);
    case Clocks::State::Running:
        m_heartbeat.Beat();
    }
    return {};
}

} // namespace standins
