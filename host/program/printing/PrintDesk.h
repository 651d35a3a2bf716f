#pragma once

#include "host/program/printing/Submission.h"

#include <condition_variable>
#include <deque>
#include <functional>
#include <future>
#include <mutex>
#include <thread>

/// Talks to one print server in a thread of its own, since a server may take its time to answer, or
/// never do.
class PrintDesk {
public:
    using Question = std::function<PrintReply(Spooler&)>;

    /// @param server see PrintTicket
    /// @param onReply called in the thread when there is a reply
    PrintDesk(const wxString& server, std::function<void()> onReply);
    /// What has not been asked yet never is.
    ~PrintDesk();
    PrintDesk(const PrintDesk&) = delete;
    PrintDesk& operator=(const PrintDesk&) = delete;

    /// Questions are asked one after the other.
    std::future<PrintReply> Ask(Question question);

private:
    using Task = std::packaged_task<PrintReply(Spooler&)>;

    void Run();
    std::optional<Task> Next();

    const std::function<void()> m_onReply;
    Spooler m_spooler; ///< the thread's own

    std::mutex m_mutex; ///< of what follows
    std::condition_variable m_changed;
    std::deque<Task> m_tasks;
    bool m_isStopping = false;

    std::thread m_thread; // last: it uses all of the above
};
