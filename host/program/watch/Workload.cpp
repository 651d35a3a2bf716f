#include "host/program/watch/Workload.h"

#include "host/program/workers/WorkerCount.h"

#include <algorithm>

using namespace std::chrono_literals;

namespace {

constexpr std::chrono::seconds QuietAfter = 60s;
constexpr std::chrono::seconds KnownFor = 1s;
constexpr std::size_t MostUpcoming = 64;

} // namespace

Input InputOf(const Job& job) {
    return {job.source, job.source, true};
}

void Workload::Look(Journal& journal) {
    const Clock::time_point now = Clock::now();
    if (now - m_known < KnownFor)
        return;
    m_known = now;
    m_upcoming.clear();
    m_waiting = 0;
    for (auto& [folder, counts] : journal.Counts())
        m_waiting += counts.jobs[JobState::Waiting];
    JobQuery query;
    query.state = JobState::Waiting;
    query.limit = MostUpcoming;
    for (const Job& job : journal.List(query))
        m_upcoming.push_back(InputOf(job));
}

std::size_t Workload::WorthwhileJobs(std::vector<Input> underWay) const {
    if (m_jobs > 0)
        return m_jobs;
    underWay.insert(underWay.begin(), m_upcoming.begin(), m_upcoming.end());
    return WorthwhileWorkers(underWay);
}

unsigned Workload::EngineDocuments(const std::vector<Input>& underWay, std::size_t settling) {
    const std::size_t coming = m_waiting + underWay.size() + 1 + settling;
    const std::size_t documents = std::max(coming, ++m_begun);
    m_engineDocuments =
        std::max(m_engineDocuments, WorthwhileEngineDocuments(documents, WorthwhileJobs(underWay)));
    return m_givenEngineDocuments.value_or(m_engineDocuments);
}

bool Workload::IsQuiet(bool isBusy) {
    const Clock::time_point now = Clock::now();
    if (isBusy)
        m_lastWork = now;
    if (now - m_lastWork < QuietAfter)
        return false;
    m_begun = 0;
    m_engineDocuments = 1;
    return true;
}
