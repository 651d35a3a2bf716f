#include "host/program/watch/WatchService.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"
#include "host/program/machine/MissingParts.h"
#include "host/program/system/Interruption.h"
#include "host/program/system/ServiceManager.h"
#include "host/program/watch/FreeSpace.h"
#include "host/program/watch/Retention.h"

#include <wx/intl.h>

#include <algorithm>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

constexpr std::chrono::seconds BetweenHeartbeats = 10s;
constexpr std::chrono::seconds BetweenStatuses = 1s;
constexpr std::chrono::seconds BetweenMeetings = 5s;
constexpr std::chrono::minutes BetweenSweeps = 10min;
constexpr std::chrono::minutes BetweenRemovals = 1min;

/// How long a document under way may take to be finished before the program ends, beyond what a
/// service is given anyway.
constexpr std::chrono::seconds DrainingTakes = 120s;

/// In lower case, without dots.
std::set<std::string> ExtensionsOf(const FilterSet& filters) {
    std::set<std::string> extensions;
    for (const auto& filter : filters.Filters())
        for (const wxString& extension : filter->Extensions())
            extensions.insert(extension.Lower().utf8_string());
    return extensions;
}

/// Extensions of documents that there is no application for on this machine.
std::set<std::string> FindUnopenable(const FilterSet& filters) {
    std::set<std::string> extensions;
    for (const std::string& extension : ExtensionsOf(filters)) {
        const auto application = ApplicationForExtension(wxString::FromUTF8(extension));
        if (application && FindMissingApplication(*application))
            extensions.insert(extension);
    }
    return extensions;
}

} // namespace

WatchService::WatchService(WatchConfiguration configuration, Means means, Journal& journal,
                           const FilterSet& filters, StatusBoard& board, Reporter& reporter)
    : m_configuration(std::move(configuration)), m_means(std::move(means)), m_journal(journal),
      m_filters(filters), m_board(board), m_reporter(reporter), m_report(reporter),
      m_claimant({m_means.self.name, m_configuration.lease, {}}),
      m_work({m_claimant, m_means.workerArguments, m_means.workerPatience, m_means.language,
              m_means.engineDocuments, m_configuration.jobs,
              [this](const Job& job, const Outcome& outcome) { OnEnd(job, outcome); },
              [this](const Job& job) {
                  if (m_audience)
                      m_audience->OnRetry(job);
              }},
             journal, m_folders, filters),
      m_started(std::chrono::system_clock::now()) {
    if (SharedJournal* const shared = journal.Shared())
        m_membership = std::make_unique<QueueMembership>(*shared, m_claimant, m_means.self,
                                                         m_means.finder, m_configuration.map);
}

ExitCode WatchService::Run() {
    bool isReady = false;
    while (!m_isOver && !(m_isDraining && IsDrained())) {
        Pass();
        if (!isReady && m_isOpen) {
            if (const std::optional<Fault> other = FindOtherWatcher())
                return m_reporter.Error(*other);
            isReady = std::all_of(m_folders.begin(), m_folders.end(),
                                  [](const auto& folder) { return folder.View().hasLooked; });
            if (isReady) {
                TellReady();
                m_met = {};
            }
        }
        m_report.TellObstacles(m_folders);
        m_work.Step();
    }
    const ExitCode exitCode = Verdict();
    m_folders.clear();
    m_work.Close();
    return exitCode;
}

void WatchService::TellReady() {
    m_report.TellFolders(m_folders);
    if (m_folders.empty())
        m_reporter.Line(
            _("No machine has told of a folder yet; documents are begun when one does."));
    ServiceManager::TellReady();
}

/// With a journal that takes nothing, no document comes further.
bool WatchService::IsDrained() const {
    return m_journalFault.empty() ? !m_work.IsBusy() : m_work.Running().empty();
}

ExitCode WatchService::Verdict() const {
    if (!m_means.once)
        return ExitCode::Done;
    if (m_isDraining)
        return ExitCode::Interrupted;
    const bool isBlocked = std::any_of(m_folders.begin(), m_folders.end(), [](const auto& folder) {
        return folder.Obstacle().has_value();
    });
    if (isBlocked)
        return ExitCode::MachineAtFault;
    return m_report.HasFailures() ? ExitCode::DocumentsAtFault : ExitCode::Done;
}

void WatchService::OpenFolders(const std::vector<FolderConfiguration>& folders) {
    const std::set<std::string> extensions = ExtensionsOf(m_filters);
    const std::map<wxString, FolderCounts> counts = m_journal.Counts();
    m_isOpen = true;
    m_folders.clear();
    for (const FolderConfiguration& folder : folders)
        m_folders.emplace_back(folder, extensions, m_membership != nullptr,
                               counts.count(folder.name) != 0, [this] { m_work.Wake(); });
}

/// @return why the watch cannot begin
std::optional<Fault> WatchService::FindOtherWatcher() const {
    for (const WatchedFolder& folder : m_folders)
        if (folder.View().fault && folder.View().fault->blame == Blame::Usage)
            return folder.View().fault;
    return std::nullopt;
}

/// A configuration that cannot be used changes nothing.
void WatchService::Reload() {
    if (!m_means.reload)
        return;
    ServiceManager::TellReloading();
    Fault fault;
    if (std::optional<WatchConfiguration> configuration = m_means.reload(fault)) {
        OpenFolders(configuration->folders);
        m_configuration.folders = configuration->folders;
        m_configuration.minFree = configuration->minFree;
        m_reporter.Line(_("The configuration has been read anew. A change of journal, jobs or http "
                          "takes effect when the program is started again."));
    } else {
        m_reporter.Error(fault);
        m_reporter.Line(_("The configuration stays as it was."));
    }
    ServiceManager::TellReady();
}

/// Looks after all that there is to do. What the journal does not take now is done in a later
/// pass.
void WatchService::Pass() {
    const Clock::time_point now = Clock::now();
    if (!m_isDraining && Interruption::Requested()) {
        m_isDraining = true;
        ServiceManager::TellStopping(DrainingTakes);
    }
    try {
        if (!m_isDraining && Interruption::ReloadRequested())
            Reload();
        MeetOthers(now);
        if (!m_isOpen)
            OpenFolders(m_configuration.folders);
        m_paused = m_journal.Paused();
        LookAfterFolders();
        if (!m_isDraining && Works())
            m_work.BeginJobs();
        m_work.PrintJobs();
        const bool hasEnded = m_work.EndJob();
        m_work.Rest();
        if (now - m_heartbeat > std::min(BetweenHeartbeats, m_claimant.lease / 3)) {
            m_work.Heartbeat();
            m_heartbeat = now;
            if (m_isDraining)
                ServiceManager::TellStopping(DrainingTakes);
        }
        if (now - m_removedOld > BetweenRemovals) {
            for (const WatchedFolder& folder : m_folders)
                if (!folder.Configuration()->isOthers)
                    RemoveOldDocuments(*folder.Configuration(), m_journal);
            m_removedOld = now;
        }
        m_isOver = m_means.once && !hasEnded && IsDone();
        m_lastPass = now;
        m_journalFault.clear();
    } catch (const JournalError& error) {
        const wxString fault = wxString::FromUTF8(error.what());
        if (m_journalFault != fault)
            SetLevelAndGetLogger(LevelError, __FILE__, __func__, __LINE__)
                << "The journal cannot be used: " << fault;
        m_journalFault = fault;
        m_mustForget = true;
    }
    ServiceManager::TellAlive(); // a journal on a full disk is not mended by another start
    if (now - m_told > BetweenStatuses)
        TellStatus();
}

void WatchService::LookAfterFolders() {
    std::error_code none; // then engines have none either, and say so
    std::vector<fs::path> places = {fs::temp_directory_path(none)};
    if (!m_membership)
        places.push_back(FromArgument(m_configuration.journal).parent_path());
    const std::optional<Fault> shortage = FindShortage(places, m_configuration.minFree);
    if (std::exchange(m_mustForget, false))
        for (WatchedFolder& folder : m_folders)
            folder.Watcher().Forget();
    for (WatchedFolder& folder : m_folders) {
        folder.Update(m_paused, m_configuration.minFree, shortage);
        if (folder.View().awaitsAdmission) {
            Recover(folder);
            folder.Watcher().Admit();
        }
        Insert(folder);
    }
}

/// Puts a folder's affairs in order before it is begun with.
void WatchService::Recover(WatchedFolder& folder) {
    if (!Works())
        return;
    if (const std::size_t count = m_work.Recover({&folder}))
        m_reporter.Line(
            wxString::Format(wxPLURAL("%s: recovered %zu document", "%s: recovered %zu documents",
                                      static_cast<unsigned>(count)),
                             folder.Name(), count));
    m_work.Sweep(folder.Configuration()->out);
}

/// Takes over what other machines have lost, and removes what they have left.
void WatchService::TakeOver(Clock::time_point now) {
    std::vector<WatchedFolder*> folders;
    for (WatchedFolder& folder : m_folders)
        if (folder.MayBegin(now))
            folders.push_back(&folder);
    const bool isSweeping = now - m_swept > BetweenSweeps;
    if (folders.empty() || (m_work.Recover(folders) == 0 && !isSweeping))
        return;
    for (const WatchedFolder* const folder : folders)
        m_work.Sweep(folder->Configuration()->out);
    m_swept = now;
}

/// Whether it converts documents, too.
bool WatchService::Works() const {
    return !m_membership || !m_means.self.finds || m_configuration.jobs > 0;
}

/// Tells others of the folders that are this machine's: one that another one watches is not.
void WatchService::Announce() {
    std::vector<FolderConfiguration> folders;
    std::vector<wxString> all;
    for (const WatchedFolder& folder : m_folders) {
        all.push_back(folder.Name());
        if (folder.View().hasLooked && !folder.View().fault)
            folders.push_back(*folder.Configuration());
    }
    if (m_isOpen)
        m_untold = m_membership->Announce(folders, all);
}

/// Tells others that have the same journal of this machine, hears of them, and takes over what they
/// have lost.
void WatchService::MeetOthers(Clock::time_point now) {
    if (!m_membership || now - m_met < std::min(BetweenMeetings, m_claimant.lease / 3))
        return;
    if (m_means.self.finds) {
        Announce();
    } else if (auto folders = m_membership->News()) {
        m_configuration.folders = std::move(*folders);
        m_isOpen = false;
    }
    if (Works()) {
        m_claimant.cannot = FindUnopenable(m_filters);
        TakeOver(now);
    }
    m_membership->Report(Status());
    m_met = now;
}

void WatchService::Insert(WatchedFolder& folder) {
    std::vector<NewJob> jobs;
    for (SettledFile& file : folder.Watcher().Take())
        jobs.push_back({folder.Name(), std::move(file.path), file.inside, file.identity,
                        folder.Configuration()->priority, std::move(file.digest)});
    if (jobs.empty())
        return;
    m_journal.Insert(jobs);
    m_work.Expect();
}

WatchStatus WatchService::Status() const {
    WatchStatus status;
    status.started = m_started;
    status.lastPass = m_lastPass;
    if (!m_journalFault.empty())
        status.journalFault = wxString::Format(_("the journal cannot be used: %s"), m_journalFault);
    status.draining = m_isDraining;
    for (const WatchedFolder& folder : m_folders) {
        status.folders.push_back(folder.Status());
        wxString& obstacle = status.folders.back().obstacle;
        if (const auto untold = m_untold.find(folder.Name()); untold != m_untold.end())
            obstacle << (obstacle.empty() ? "" : "; ") << untold->second.Text();
    }
    status.running = m_work.Running();
    return status;
}

void WatchService::TellStatus() {
    m_told = Clock::now();
    WatchStatus status = Status();
    ServiceManager::TellStatus(m_report.Line(status));
    m_report.ShowProgress(status, m_work.Waiting());
    m_board.Put(std::move(status));
}

/// Whether nothing is left that has settled, or may yet.
bool WatchService::IsDone() const {
    if (m_isDraining || m_work.IsBusy() || m_work.IsPrinting())
        return false;
    for (const WatchedFolder& folder : m_folders) {
        const FolderWatcher::View& view = folder.View();
        const bool isLookingYet = !view.hasLooked || view.awaitsAdmission || view.scans == 0;
        if (!view.fault && (isLookingYet || view.settling > 0))
            return false;
    }
    return true; // whatever waits could have been begun, and was not: it waits for another day
}

void WatchService::OnEnd(const Job& job, const Outcome& outcome) {
    m_report.Tell(job, outcome);
    if (m_audience)
        m_audience->OnEnd(job, outcome);
}
