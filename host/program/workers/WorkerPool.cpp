#include "host/program/workers/WorkerPool.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"
#include "host/program/base/Reasons.h"
#include "host/program/documents/Screening.h"
#include "host/program/documents/Workplace.h"
#include "host/program/system/Interruption.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/intl.h>

#include <algorithm>

using Clock = std::chrono::steady_clock;

WorkerPool::WorkerPool(std::vector<std::string> arguments, std::chrono::seconds patience,
                       RunFacts facts, const FilterSet& filters, Reporter& reporter)
    : m_arguments(std::move(arguments)), m_patience(patience), m_facts(std::move(facts)),
      m_filters(filters), m_reporter(reporter) {}

WorkerPool::~WorkerPool() {
    for (Worker& worker : m_workers) // none are left but after an exception
        if (worker.process) {
            worker.process->Kill();
            worker.reader.join();
        }
}

void WorkerPool::Run(const std::vector<Assignment>& assignments, std::size_t workers,
                     const Deliver& deliver) {
    m_assignments = &assignments;
    m_deliver = &deliver;
    m_workers.resize(std::min(workers, assignments.size()));
    m_looked = Clock::now();
    for (std::size_t number = 0; number < m_workers.size(); ++number)
        GiveWork(number);
    while (IsAnyBusy()) {
        if (const std::optional<Event> event = Await()) {
            if (event->line)
                OnLine(event->worker, *event->line);
            else
                OnEnd(event->worker);
        }
        EndTheSilent();
    }
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

/// Gives the worker the next assignment, if there is one.
void WorkerPool::GiveWork(std::size_t number) {
    while (m_next < m_assignments->size() && !m_workers[number].assignment) {
        const std::size_t assignment = m_next++;
        if (Interruption::Requested())
            (*m_deliver)(assignment, NotReached(m_filters, (*m_assignments)[assignment].input));
        else
            Assign(number, assignment);
    }
}

void WorkerPool::Assign(std::size_t number, std::size_t assignment) {
    Worker& worker = m_workers[number];
    const Assignment& work = (*m_assignments)[assignment];
    worker.assignment = assignment;
    worker.begun = false;
    worker.progress.emplace(m_reporter, Shown(work.input.given.filename()));
    // When it has ended meanwhile, its reader will say so.
    if (EnsureProcess(number))
        worker.process->Channel().Write(Encode(work));
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
    LineChannel& channel = worker.process->Channel();
    channel.Write(Encode(m_facts));
    worker.reader = std::thread([this, number, &channel] {
        while (std::optional<std::string> line = channel.Read())
            Post({number, std::move(line)});
        Post({number, std::nullopt});
    });
    return true;
}

void WorkerPool::OnLine(std::size_t number, const std::string& line) {
    Worker& worker = m_workers[number];
    worker.heard = Clock::now();
    if (line == SignOfLife || !worker.assignment)
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
        GiveWork(number);
    } else {
        ShowProgress(worker, *news);
    }
}

void WorkerPool::OnEnd(std::size_t number) {
    Worker& worker = m_workers[number];
    worker.reader.join();
    worker.process->Kill(); // it may only have closed its side
    Fault end = worker.process->Wait();
    worker.process.reset();
    SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
        << "A worker has " << end.what << (worker.assignment ? " with a document under way" : "");
    Workplace::RemoveAbandoned(m_facts.outputFolder);
    if (!worker.assignment)
        return;
    if (worker.ending)
        end = {worker.ending};
    const bool fromOutside = end.blame == Blame::Outside;
    if (worker.proven && !worker.begun) { // it ended before the document reached it
        Assign(number, *worker.assignment);
    } else if (fromOutside && !worker.triedAgain) {
        worker.triedAgain = true;
        Assign(number, *worker.assignment);
    } else {
        end.what =
            wxString::Format(_("the process that converted it %s"), TranslateReason(end.what));
        if (fromOutside)
            end.what = wxString::Format(_("%s, at the second try too"), end.what);
        Fail(number, end);
    }
    GiveWork(number);
}

void WorkerPool::Finish(std::size_t number, Outcome outcome) {
    Worker& worker = m_workers[number];
    ++m_done;
    (*m_deliver)(*worker.assignment, std::move(outcome));
    worker.assignment.reset();
    worker.triedAgain = false;
}

/// Ends a worker; its reader will say so.
/// @param reason why, as what it has done
void WorkerPool::End(Worker& worker, const char* reason) {
    if (worker.ending)
        return;
    worker.ending = reason;
    worker.process->Kill();
}

void WorkerPool::Fail(std::size_t number, const Fault& fault) {
    Outcome outcome;
    outcome.input = (*m_assignments)[*m_workers[number].assignment].input.given;
    outcome.End(State::Failed, fault, m_filters.ErrorText(fault.code));
    Finish(number, std::move(outcome));
}

void WorkerPool::ShowProgress(Worker& worker, const News& news) {
    if (!m_reporter.ForTerminal()) {
        worker.progress->Report(news.step, news.percent);
        return;
    }
    wxString names; // one line is there for all that is under way
    for (const Worker& each : m_workers)
        if (each.assignment)
            names << (names.empty() ? "" : ", ") << each.progress->Document();
    m_reporter.Passing(ProgressLine(
        static_cast<int>(m_done * 100 / m_assignments->size()),
        wxString::Format(_("%zu of %zu"), m_done, m_assignments->size()) + "  " + names));
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

bool WorkerPool::IsAnyBusy() const {
    return std::any_of(m_workers.begin(), m_workers.end(),
                       [](const Worker& worker) { return worker.assignment.has_value(); });
}

void WorkerPool::Post(Event event) {
    const std::lock_guard lock(m_mutex);
    m_events.push_back(std::move(event));
    m_posted.notify_one();
}

/// @return nothing when there was none for some time
std::optional<WorkerPool::Event> WorkerPool::Await() {
    std::unique_lock lock(m_mutex);
    if (!m_posted.wait_for(lock, BetweenSignsOfLife, [this] { return !m_events.empty(); }))
        return std::nullopt;
    Event event = std::move(m_events.front());
    m_events.pop_front();
    return event;
}
