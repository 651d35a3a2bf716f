#pragma once

#include "standins/shared/Channel.h"

#include <chrono>

namespace standins {

/// Tells the server from time to time that the supervisor is at work.
class Heartbeat {
public:
    explicit Heartbeat(const Channel& server) : m_server(server) {}

    /// To be called as often as there is occasion; most of the time it does nothing.
    void Beat() {
        constexpr std::chrono::milliseconds Interval(250);
        const Time::time_point now = Time::now();
        if (now < m_next)
            return;
        m_next = now + Interval;
        m_server.Send(MessageKind::Alive);
    }

private:
    using Time = std::chrono::steady_clock;

    const Channel& m_server;
    Time::time_point m_next; ///< long past at first
};

} // namespace standins
