#include "host/program/watch/WatchedFolders.h"

#include "host/program/watch/FreeSpace.h"

#include <algorithm>

void WatchedFolders::Open(const std::vector<FolderConfiguration>& folders,
                          const std::map<wxString, FolderCounts>& counts) {
    m_folders.clear();
    for (const FolderConfiguration& folder : folders)
        m_folders.emplace_back(folder, m_extensions, m_digests, counts.count(folder.name) != 0,
                               m_onNews);
}

WatchedFolder* WatchedFolders::Find(const wxString& name) {
    const auto found =
        std::find_if(m_folders.begin(), m_folders.end(),
                     [&name](const WatchedFolder& folder) { return folder.Name() == name; });
    return found == m_folders.end() ? nullptr : &*found;
}

void WatchedFolders::Update(const std::set<wxString>& paused, std::uintmax_t minFree,
                            const std::vector<std::filesystem::path>& places) {
    const std::optional<Fault> shortage = FindShortage(places, minFree);
    for (WatchedFolder& folder : m_folders)
        folder.Update(paused, minFree, shortage);
}

bool WatchedFolders::Insert(WatchedFolder& folder, Journal& journal) {
    std::vector<NewJob> jobs;
    for (SettledFile& file : folder.Watcher().Take())
        jobs.push_back({folder.Name(), std::move(file.path), file.inside, file.identity,
                        folder.Configuration()->priority, std::move(file.digest)});
    if (jobs.empty())
        return false;
    journal.Insert(jobs);
    return true;
}

void WatchedFolders::Forget() {
    for (WatchedFolder& folder : m_folders)
        folder.Watcher().Forget();
}

std::size_t WatchedFolders::Settling() const {
    std::size_t settling = 0;
    for (const WatchedFolder& folder : m_folders)
        settling += folder.View().settling;
    return settling;
}

bool WatchedFolders::HaveBeenSeen() const {
    return std::all_of(m_folders.begin(), m_folders.end(),
                       [](const WatchedFolder& folder) { return folder.View().hasLooked; });
}

bool WatchedFolders::HaveSettled() const {
    return std::all_of(m_folders.begin(), m_folders.end(), [](const WatchedFolder& folder) {
        const FolderWatcher::View& view = folder.View();
        const bool isLookingYet = !view.hasLooked || view.awaitsAdmission || view.scans == 0;
        return view.fault || (!isLookingYet && view.settling == 0);
    });
}

bool WatchedFolders::IsAnyBlocked() const {
    return std::any_of(m_folders.begin(), m_folders.end(),
                       [](const WatchedFolder& folder) { return folder.Obstacle().has_value(); });
}

std::optional<Fault> WatchedFolders::Misuse() const {
    for (const WatchedFolder& folder : m_folders)
        if (folder.View().fault && folder.View().fault->blame == Blame::Usage)
            return folder.View().fault;
    return std::nullopt;
}
