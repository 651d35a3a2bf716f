#pragma once

#include "host/program/base/Fault.h"
#include "host/program/system/ChildProcess.h"
#include "host/program/workers/Messages.h"

#include <chrono>
#include <condition_variable>
#include <deque>
#include <mutex>
#include <thread>

/// Converts documents side by side, each worker in a process of its own. A worker serves one
/// document after the other; one that ends, or gives no sign of life any more, fails the document
/// that it had, and is replaced. One that somebody has ended fails none: its document is tried once
/// more. Nothing happens but in the calls of its owner, who goes on calling Step.
class WorkerPool {
public:
    /// Names an assignment to the owner.
    using Ticket = std::int64_t;

    /// Told what comes of the assignments.
    class Owner {
    public:
        virtual ~Owner() = default;
        virtual void OnProgress(Ticket ticket, const wxString& step, int percent) = 0;
        /// The document is free again. What it came to has no message where no worker could say
        /// it.
        virtual void OnOutcome(Ticket ticket, Outcome outcome) = 0;
    };

    /// @param arguments that make this program a worker
    /// @param patience how long a worker may give no sign of life
    /// @param owner outlives the pool
    WorkerPool(std::vector<std::string> arguments, std::chrono::seconds patience, Owner& owner);
    /// Ends the workers at once, and what they have under way.
    ~WorkerPool();
    WorkerPool(const WorkerPool&) = delete;
    WorkerPool& operator=(const WorkerPool&) = delete;

    /// Has a document converted: by a worker that is idle, or else by one more.
    void Give(Ticket ticket, Assignment assignment);

    /// How many documents are under way.
    std::size_t Busy() const;

    /// Waits for something to happen, and deals with it.
    /// @param longest to wait for
    void Step(std::chrono::milliseconds longest = BetweenSignsOfLife);

    /// Ends a wait in Step. From any thread.
    void Wake();

    /// Lets the workers end that have had nothing to do for some time.
    void Retire(std::chrono::seconds idleFor);

    /// Lets all workers end, none of which is busy, and waits for it.
    void Close();

private:
    using Clock = std::chrono::steady_clock;

    struct Worker {
        std::unique_ptr<ChildProcess> process;
        std::thread reader; ///< reads what the process says until it has ended
        std::optional<Ticket> ticket;
        Assignment assignment;
        int attempts = 0;             ///< at the assignment
        bool begun = false;           ///< with the assignment
        bool triedAgain = false;      ///< the assignment
        bool proven = false;          ///< has brought a document to an end
        const char* ending = nullptr; ///< why it was ended from here
        Clock::time_point heard;      ///< its last sign of life
        Clock::time_point idleSince;
    };
    /// A line from a worker, or nothing when it has ended.
    struct Event {
        std::size_t worker;
        std::optional<std::string> line;
    };

    std::size_t IdleWorker();
    void Begin(std::size_t number);
    bool EnsureProcess(std::size_t number);
    void OnLine(std::size_t number, const std::string& line);
    void OnEnd(std::size_t number);
    void Finish(std::size_t number, Outcome outcome);
    void Fail(std::size_t number, Fault fault);
    static void End(Worker& worker, const char* reason);
    void EndTheSilent();
    void Post(Event event);
    std::optional<Event> Await(std::chrono::milliseconds longest);

    const std::vector<std::string> m_arguments;
    const std::chrono::seconds m_patience;
    Owner& m_owner;
    Clock::time_point m_looked; ///< for silent workers
    std::deque<Worker> m_workers;

    std::mutex m_mutex; ///< of what follows, which the readers share
    std::condition_variable m_posted;
    std::deque<Event> m_events;
    bool m_woken = false;
};
