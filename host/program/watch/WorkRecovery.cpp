#include "host/program/watch/WorkRecovery.h"

#include "common/WQServices.h"
#include "host/program/watch/JobDecision.h"

#include <algorithm>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

constexpr std::chrono::minutes BetweenSweeps = 10min;

} // namespace

std::size_t WorkRecovery::Recover(WatchedFolder& folder) {
    return TakeOver({&folder});
}

void WorkRecovery::TakeOver(Clock::time_point now) {
    std::vector<WatchedFolder*> folders;
    for (WatchedFolder& folder : m_folders)
        if (folder.MayBegin(now))
            folders.push_back(&folder);
    const bool isSweeping = now - m_swept > BetweenSweeps;
    if (folders.empty() || (TakeOver(folders) == 0 && !isSweeping))
        return;
    for (const WatchedFolder* const folder : folders)
        Sweep(folder->Configuration()->out);
    m_swept = now;
}

/// @return how many documents there were
std::size_t WorkRecovery::TakeOver(const std::vector<WatchedFolder*>& folders) {
    std::vector<wxString> names;
    names.reserve(folders.size());
    for (const WatchedFolder* const folder : folders)
        names.push_back(folder->Name());
    std::size_t count = 0;
    for (Job& job : m_journal.TakeOver(names, m_claimant))
        count += Adopt(std::move(job)) ? 1 : 0;
    return count;
}

/// @return whether it is not one that this program has in hand
bool WorkRecovery::Adopt(Job job) {
    if (DocumentInHand* const known = m_inHand.Find(job)) {
        known->job.token = job.token; // the folder was away, its document was not
        return false;
    }
    DocumentInHand& document = m_inHand.ending[m_inHand.NewTicket()];
    document.folder = m_folders.Find(job.folder)->Configuration();
    if (!job.workplace.empty())
        document.workplace = Workplace::TakeOver(job.workplace.parent_path());
    if (job.state == JobState::Converting) {
        DecideByDeath(job, m_filters.ErrorText(ConversionFailed), m_journal.Now());
        document.isToBeTold = true;
    }
    document.job = std::move(job);
    return true;
}

/// Whether the journal knows of an output that is not in its place, and of which this holds.
bool WorkRecovery::HasJobWithProduct(const std::function<bool(const Job&)>& isMeant) {
    for (const JobState state : {JobState::Submitting, JobState::Printing, JobState::Delivering}) {
        JobQuery query;
        query.state = state;
        const std::vector<Job> jobs = m_journal.List(query);
        if (std::any_of(jobs.begin(), jobs.end(), isMeant))
            return true;
    }
    return false;
}

void WorkRecovery::Sweep(const fs::path& outputFolder) {
    const auto isOthers = [&](const Job& job) {
        return !m_inHand.Find(job) && job.workplace.parent_path().parent_path() == outputFolder;
    };
    if (HasJobWithProduct(isOthers))
        return; // its folder's turn comes, or it is watched no more
    Workplace::RemoveAbandoned(outputFolder, Workplace::Kind::OfWatch);
}

void WorkRecovery::Abandon(DocumentInHand& document) {
    SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
        << "Document " << std::to_string(document.job.id) << " of " << document.job.folder
        << " is somebody else's by now: this program was too slow, or could not be heard";
    const auto isProduct = [&document](const Job& job) {
        return job.workplace.parent_path() == document.workplace->Path();
    };
    if (document.workplace && HasProduct(document.job.state) && HasJobWithProduct(isProduct))
        document.workplace->Leave();
}
