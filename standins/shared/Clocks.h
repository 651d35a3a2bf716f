#pragma once

#include <chrono>
#include <cstdint>

namespace standins {

/// How long a piece of work may take.
struct TimeLimits {
    std::chrono::seconds stall; ///< without a sign of life
    std::chrono::seconds total; ///< altogether
};

/// What moves while a process is at work.
struct LifeSign {
    std::uint64_t cpuTicks = 0;
    std::uint64_t bytesWritten = 0;

    bool operator==(const LifeSign& other) const {
        return cpuTicks == other.cpuTicks && bytesWritten == other.bytesWritten;
    }
};

/// The two clocks on a piece of work: one starts again with each sign of life, the other never.
class Clocks {
public:
    enum class State { Running, Stalled, Overdue };

    explicit Clocks(TimeLimits limits);

    /// @param sign as it stands now
    State Check(const LifeSign& sign);

    /// How long to wait until the next check.
    std::chrono::milliseconds Interval() const;

private:
    using Time = std::chrono::steady_clock;

    TimeLimits m_limits;
    Time::time_point m_start;
    Time::time_point m_lastSign;
    LifeSign m_sign;
};

} // namespace standins
