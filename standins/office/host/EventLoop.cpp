#include "standins/office/host/EventLoop.h"

namespace standins {

int EventLoop::Poll(void* loop, int microseconds) {
    auto* const self = static_cast<EventLoop*>(loop);
    if (!self->m_serves) {
        self->m_serves = true;
        self->m_serve();
    }
    self->Wait(microseconds);
    return 0;
}

void EventLoop::Wake(void* loop) {
    auto* const self = static_cast<EventLoop*>(loop);
    const std::lock_guard lock(self->m_mutex);
    self->m_isWoken = true;
    self->m_woken.notify_all();
}

/// What has been missed is found out about by looking again: so no wait is long.
void EventLoop::Wait(int microseconds) {
    constexpr std::chrono::milliseconds Longest(50);
    std::unique_lock lock(m_mutex);
    const auto time =
        microseconds < 0
            ? Longest
            : std::min<std::chrono::microseconds>(Longest, std::chrono::microseconds(microseconds));
    m_woken.wait_for(lock, time, [this] { return m_isWoken; });
    m_isWoken = false;
}

} // namespace standins
