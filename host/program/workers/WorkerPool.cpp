#include "host/program/workers/WorkerPool.h"

#include "common/WQServices.h"
#include "host/program/base/Reasons.h"

#include <wx/intl.h>

#include <algorithm>

WorkerPool::WorkerPool(std::vector<std::string> arguments, std::chrono::seconds patience,
                       Owner& owner)
    : m_arguments(std::move(arguments)), m_patience(patience), m_owner(owner),
      m_looked(Clock::now()) {}

WorkerPool::~WorkerPool() {
    for (Worker& worker : m_workers)
        if (worker.process) {
            worker.process->Kill();
            worker.reader.join();
        }
}

void WorkerPool::Give(Ticket ticket, Assignment assignment) {
    const std::size_t number = IdleWorker();
    Worker& worker = m_workers[number];
    worker.ticket = ticket;
    worker.assignment = std::move(assignment);
    worker.attempts = 0;
    worker.triedAgain = false;
    Begin(number);
}

/// @return one that has a process, if there is any such
std::size_t WorkerPool::IdleWorker() {
    std::size_t idle = m_workers.size();
    for (std::size_t number = m_workers.size(); number-- > 0;)
        if (!m_workers[number].ticket && (idle == m_workers.size() || m_workers[number].process))
            idle = number;
    if (idle == m_workers.size())
        m_workers.emplace_back();
    return idle;
}

std::size_t WorkerPool::Busy() const {
    return static_cast<std::size_t>(
        std::count_if(m_workers.begin(), m_workers.end(),
                      [](const Worker& worker) { return worker.ticket.has_value(); }));
}

void WorkerPool::Step(std::chrono::milliseconds longest) {
    if (const std::optional<Event> event = Await(longest)) {
        if (event->line)
            OnLine(event->worker, *event->line);
        else
            OnEnd(event->worker);
    }
    EndTheSilent();
}

void WorkerPool::Retire(std::chrono::seconds idleFor) {
    const Clock::time_point now = Clock::now();
    for (Worker& worker : m_workers)
        if (worker.process && !worker.ticket && now - worker.idleSince > idleFor)
            worker.process->Channel().CloseOutput(); // its reader will say that it has ended
}

void WorkerPool::Close() {
    for (Worker& worker : m_workers)
        if (worker.process)
            worker.process->Channel().CloseOutput();
    for (Worker& worker : m_workers)
        if (worker.process) {
            worker.reader.join();
            worker.process->Wait();
            worker.process.reset();
        }
}

/// Has the worker try its assignment, in a folder of its own: what has had the last one may still
/// be writing.
void WorkerPool::Begin(std::size_t number) {
    Worker& worker = m_workers[number];
    worker.begun = false;
    Assignment attempt = worker.assignment;
    attempt.workplace /= std::to_string(++worker.attempts);
    // When it has ended meanwhile, its reader will say so.
    if (EnsureProcess(number))
        worker.process->Channel().Write(Encode(attempt));
}

/// @return whether the worker has a process; if not, its assignment has failed
bool WorkerPool::EnsureProcess(std::size_t number) {
    Worker& worker = m_workers[number];
    if (worker.process)
        return true;
    Fault fault;
    worker.process = ChildProcess::Start(m_arguments, fault);
    if (!worker.process) {
        fault.what = wxString::Format(_("no process could be started for it: %s"), fault.what);
        Fail(number, fault);
        return false;
    }
    worker.proven = false;
    worker.ending = nullptr;
    worker.heard = Clock::now();
    worker.reader = std::thread([this, number, &channel = worker.process->Channel()] {
        while (std::optional<std::string> line = channel.Read())
            Post({number, std::move(line)});
        Post({number, std::nullopt});
    });
    return true;
}

void WorkerPool::OnLine(std::size_t number, const std::string& line) {
    Worker& worker = m_workers[number];
    worker.heard = Clock::now();
    if (line == SignOfLife || !worker.ticket)
        return;
    std::optional<News> news = DecodeNews(line);
    if (!news) {
        End(worker, "answered what makes no sense, and was ended");
        return;
    }
    worker.begun = true;
    if (news->outcome) {
        worker.proven = true;
        Finish(number, std::move(*news->outcome));
    } else {
        m_owner.OnProgress(*worker.ticket, news->step, news->percent);
    }
}

void WorkerPool::OnEnd(std::size_t number) {
    Worker& worker = m_workers[number];
    worker.reader.join();
    worker.process->Kill(); // it may only have closed its side
    Fault end = worker.process->Wait();
    worker.process.reset();
    if (!worker.ticket) {
        SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__)
            << "A worker without a document has " << end.what;
        return;
    }
    SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
        << "A worker has " << end.what << " with a document under way";
    if (worker.ending)
        end = {worker.ending};
    const bool fromOutside = end.blame == Blame::Outside;
    if (worker.proven && !worker.begun) { // it ended before the document reached it
        Begin(number);
    } else if (fromOutside && !worker.triedAgain) {
        worker.triedAgain = true;
        Begin(number);
    } else {
        end.what =
            wxString::Format(_("the process that converted it %s"), TranslateReason(end.what));
        if (fromOutside)
            end.what = wxString::Format(_("%s, at the second try too"), end.what);
        Fail(number, end);
    }
}

void WorkerPool::Finish(std::size_t number, Outcome outcome) {
    Worker& worker = m_workers[number];
    const Ticket ticket = *worker.ticket;
    worker.ticket.reset();
    worker.idleSince = Clock::now();
    m_owner.OnOutcome(ticket, std::move(outcome));
}

/// Ends a worker; its reader will say so.
/// @param reason why, as what it has done
void WorkerPool::End(Worker& worker, const char* reason) {
    if (worker.ending)
        return;
    worker.ending = reason;
    worker.process->Kill();
}

void WorkerPool::Fail(std::size_t number, Fault fault) {
    Outcome outcome;
    outcome.input = m_workers[number].assignment.input.given;
    outcome.End(State::Failed, std::move(fault), {});
    Finish(number, std::move(outcome));
}

/// Ends the workers that have been silent for too long.
void WorkerPool::EndTheSilent() {
    const Clock::time_point now = Clock::now();
    // Has this process been stopped, and its workers with it, they get their time anew.
    const bool hasSlept = now - m_looked > m_patience / 2;
    m_looked = now;
    for (Worker& worker : m_workers) {
        if (hasSlept)
            worker.heard = now;
        if (worker.process && now - worker.heard > m_patience)
            End(worker, "gave no sign of life any more and was ended");
    }
}

void WorkerPool::Post(Event event) {
    const std::lock_guard lock(m_mutex);
    m_events.push_back(std::move(event));
    m_posted.notify_one();
}

void WorkerPool::Wake() {
    const std::lock_guard lock(m_mutex);
    m_woken = true;
    m_posted.notify_one();
}

/// @return nothing when there was none for some time
std::optional<WorkerPool::Event> WorkerPool::Await(std::chrono::milliseconds longest) {
    std::unique_lock lock(m_mutex);
    m_posted.wait_for(lock, longest, [this] { return m_woken || !m_events.empty(); });
    m_woken = false;
    if (m_events.empty())
        return std::nullopt;
    Event event = std::move(m_events.front());
    m_events.pop_front();
    return event;
}
