#include "host/program/watch/Retention.h"

namespace fs = std::filesystem;

namespace {

constexpr std::chrono::hours RecordsLast{24 * 90};
constexpr std::size_t MostAtATime = 500;

/// Removes the file, unless it has become another by now.
void RemoveSource(const Job& job) {
    std::error_code error;
    const FileIdentity identity = LookAt(job.aside, error).identity;
    if (!error && identity.number == job.identity.number && identity.size == job.identity.size)
        fs::remove(job.aside, error);
}

void RemoveOldDocumentsOf(const FolderConfiguration& folder, Journal& journal) {
    const std::chrono::seconds lasts =
        folder.keepProcessed.value_or(std::chrono::seconds(RecordsLast));
    for (const JobState state : {JobState::Archived, JobState::Vanished}) {
        JobQuery query;
        query.folder = folder.name;
        query.state = state;
        query.endedBefore = journal.Now() - lasts;
        query.limit = MostAtATime;
        for (const Job& job : journal.List(query)) {
            if (folder.keepProcessed && state == JobState::Archived && !job.aside.empty())
                RemoveSource(job);
            journal.Remove(job.id);
        }
    }
}

} // namespace

void RemoveOldDocuments(const WatchedFolders& folders, Journal& journal) {
    for (const WatchedFolder& folder : folders)
        if (!folder.Configuration()->isOthers)
            RemoveOldDocumentsOf(*folder.Configuration(), journal);
}
