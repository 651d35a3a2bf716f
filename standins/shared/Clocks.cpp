#include "standins/shared/Clocks.h"

#include <algorithm>

using namespace std::chrono_literals;

namespace standins {

Clocks::Clocks(TimeLimits limits)
    : m_limits(limits), m_start(Time::now()), m_lastSign(m_start), m_sign() {}

Clocks::State Clocks::Check(const LifeSign& sign) {
    const Time::time_point now = Time::now();
    if (!(sign == m_sign)) {
        m_sign = sign;
        m_lastSign = now;
    }
    if (now - m_start >= m_limits.total)
        return State::Overdue;
    return now - m_lastSign >= m_limits.stall ? State::Stalled : State::Running;
}

std::chrono::milliseconds Clocks::Interval() const {
    const std::chrono::milliseconds shorter = std::min(m_limits.stall, m_limits.total);
    return std::clamp(shorter / 8, 20ms, 500ms);
}

} // namespace standins
