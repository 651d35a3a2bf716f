#pragma once

#include <condition_variable>
#include <functional>
#include <mutex>

namespace standins {

/// The waiting for events that LibreOffice leaves to whoever runs it, in its own form: functions
/// that are called with the loop as their first argument.
class EventLoop {
public:
    /// @param serve does all the work, when LibreOffice waits for its first event; must not return
    explicit EventLoop(std::function<void()> serve) : m_serve(std::move(serve)) {}

    /// Waits for an event. LibreOffice calls it again from within the work, from inner loops of its
    /// own: threads that read a spreadsheet wake the one that waits for them.
    /// @param microseconds at most; negative for any time
    /// @return 0
    static int Poll(void* loop, int microseconds);
    /// Ends the waiting. Called on any thread.
    static void Wake(void* loop);

private:
    void Wait(int microseconds);

    std::function<void()> m_serve;
    bool m_serves = false;
    std::mutex m_mutex; ///< of what follows
    std::condition_variable m_woken;
    bool m_isWoken = false;
};

} // namespace standins
