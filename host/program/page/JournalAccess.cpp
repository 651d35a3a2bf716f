#include "host/program/page/JournalAccess.h"

#include "host/program/journal/Machines.h"

#include <wx/intl.h>

using Clock = std::chrono::steady_clock;

namespace {

constexpr auto Freshness = std::chrono::seconds(1);
constexpr auto LongestRetry = std::chrono::seconds(5);
constexpr std::size_t FailedShown = 50;
constexpr std::size_t DoneShown = 10;
constexpr std::size_t ConvertingShown = 200;
constexpr std::size_t RetriedAtOnce = 500;

JobQuery Newest(JobState state, std::size_t limit) {
    JobQuery query;
    query.state = state;
    query.newestFirst = true;
    query.limit = limit;
    return query;
}

} // namespace

std::optional<Fault> JournalAccess::With(const std::function<void(Journal&)>& use) {
    Fault fault;
    if (!m_journal)
        m_journal = m_open(fault);
    if (!m_journal)
        return fault;
    try {
        use(*m_journal);
        return std::nullopt;
    } catch (const JournalError& error) {
        m_journal.reset(); // whatever it is, a new one may be better
        return Fault{
            wxString::Format(_("the journal cannot be used: %s"), wxString::FromUTF8(error.what())),
            Blame::Machine};
    }
}

JournalExtract JournalAccess::Read() {
    const std::lock_guard lock(m_mutex);
    if (m_readAt && Clock::now() - *m_readAt < Freshness)
        return m_extract;
    m_extract = {};
    JournalExtract extract;
    const std::optional<Fault> fault = With([&extract](Journal& journal) {
        extract.counts = journal.Counts();
        extract.paused = journal.Paused();
        extract.failed = journal.List(Newest(JobState::Failed, FailedShown));
        extract.done = journal.List(Newest(JobState::Archived, DoneShown));
        if (SharedJournal* const shared = journal.Shared()) {
            extract.machines = WithoutReplaced(shared->Machines());
            extract.converting = journal.List(Newest(JobState::Converting, ConvertingShown));
        }
    });
    if (fault)
        m_extract.fault = fault->what;
    else
        m_extract = std::move(extract);
    m_readAt = Clock::now();
    return m_extract;
}

std::optional<Fault> JournalAccess::Change(const std::function<void(Journal&)>& change) {
    const std::lock_guard lock(m_mutex);
    m_readAt.reset();
    return With(change);
}

void RetryFailed(Journal& journal, const std::optional<wxString>& folder) {
    const Clock::time_point end = Clock::now() + LongestRetry;
    JobQuery query = Newest(JobState::Failed, RetriedAtOnce);
    query.folder = folder;
    query.open = false; // the others' files are still to be put away
    for (bool more = true; more && Clock::now() < end;) {
        more = false;
        for (const Job& job : journal.List(query))
            more = journal.Retry(job.id) || more;
    }
}
