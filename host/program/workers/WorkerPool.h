#pragma once

#include "host/program/filters/FilterSet.h"
#include "host/program/report/Progress.h"
#include "host/program/system/ChildProcess.h"
#include "host/program/workers/Messages.h"

#include <chrono>
#include <condition_variable>
#include <deque>
#include <functional>
#include <mutex>
#include <thread>

/// Converts documents side by side, each worker in a process of its own. A worker serves one
/// document after the other; one that ends, or gives no sign of life any more, fails the document
/// that it had, and is replaced. One that somebody has ended fails none: its document is tried once
/// more.
class WorkerPool {
public:
    /// @param arguments that make this program a worker
    /// @param patience how long a worker may give no sign of life
    /// @param filters asked for the texts of what the workers cannot tell any more
    WorkerPool(std::vector<std::string> arguments, std::chrono::seconds patience, RunFacts facts,
               const FilterSet& filters, Reporter& reporter);
    ~WorkerPool();
    WorkerPool(const WorkerPool&) = delete;
    WorkerPool& operator=(const WorkerPool&) = delete;

    /// Receives what came of an assignment, by its number; not in order.
    using Deliver = std::function<void(std::size_t, Outcome)>;

    /// Converts all; after an interruption, those only that are under way.
    /// @param workers how many at a time
    void Run(const std::vector<Assignment>& assignments, std::size_t workers,
             const Deliver& deliver);

private:
    struct Worker {
        std::unique_ptr<ChildProcess> process;
        std::thread reader; ///< reads what the process says until it has ended
        std::optional<std::size_t> assignment;
        std::optional<Progress> progress;
        bool begun = false;                          ///< with the assignment
        bool triedAgain = false;                     ///< the assignment
        bool proven = false;                         ///< has brought a document to an end
        const char* ending = nullptr;                ///< why it was ended from here
        std::chrono::steady_clock::time_point heard; ///< its last sign of life
    };
    /// A line from a worker, or nothing when it has ended.
    struct Event {
        std::size_t worker;
        std::optional<std::string> line;
    };

    void GiveWork(std::size_t number);
    void Assign(std::size_t number, std::size_t assignment);
    bool EnsureProcess(std::size_t number);
    void OnLine(std::size_t number, const std::string& line);
    void OnEnd(std::size_t number);
    void Finish(std::size_t number, Outcome outcome);
    static void End(Worker& worker, const char* reason);
    void Fail(std::size_t number, const Fault& fault);
    void ShowProgress(Worker& worker, const News& news);
    void EndTheSilent();
    bool IsAnyBusy() const;
    void Post(Event event);
    std::optional<Event> Await();

    const std::vector<std::string> m_arguments;
    const std::chrono::seconds m_patience;
    const RunFacts m_facts;
    const FilterSet& m_filters;
    Reporter& m_reporter;

    const std::vector<Assignment>* m_assignments = nullptr;
    const Deliver* m_deliver = nullptr;
    std::size_t m_next = 0; ///< the first assignment that no worker has had
    std::size_t m_done = 0;
    std::chrono::steady_clock::time_point m_looked; ///< for silent workers
    std::deque<Worker> m_workers;

    std::mutex m_mutex; ///< of what follows, which the readers share
    std::condition_variable m_posted;
    std::deque<Event> m_events;
};
