#include "host/program/watch/WatchService.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"
#include "host/program/report/Readiness.h"
#include "host/program/system/Interruption.h"
#include "host/program/system/ServiceManager.h"
#include "host/program/watch/Retention.h"

#include <wx/intl.h>

#include <algorithm>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

constexpr std::chrono::seconds BetweenHeartbeats = 10s;
constexpr std::chrono::seconds BetweenStatuses = 1s;
constexpr std::chrono::seconds BetweenMeetings = 5s;
constexpr std::chrono::minutes BetweenRemovals = 1min;

/// How long a document under way may take to be finished before the program ends, beyond what a
/// service is given anyway.
constexpr std::chrono::seconds DrainingTakes = 120s;

} // namespace

WatchService::WatchService(WatchConfiguration configuration, Means means, Journal& journal,
                           const FilterSet& filters, StatusBoard& board, Reporter& reporter)
    : m_configuration(std::move(configuration)), m_means(std::move(means)), m_journal(journal),
      m_filters(filters), m_board(board), m_reporter(reporter), m_report(reporter),
      m_claimant({m_means.self.name, m_configuration.lease, {}}),
      m_folders(filters.Extensions(), journal.Shared() != nullptr, [this] { m_work.Wake(); }),
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
            if (const std::optional<Fault> misuse = m_folders.Misuse()) {
                m_folders.Close(); // before what they wake
                return m_reporter.Error(*misuse);
            }
            isReady = m_folders.HaveBeenSeen();
            if (isReady) {
                TellReady();
                m_met = {};
            }
        }
        m_report.TellObstacles(m_folders);
        m_work.Step();
    }
    const ExitCode exitCode = Verdict();
    m_folders.Close();
    m_work.Close();
    return exitCode;
}

void WatchService::TellReady() {
    m_report.TellFolders(m_folders);
    if (m_folders.IsEmpty())
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
    if (m_folders.IsAnyBlocked())
        return ExitCode::MachineAtFault;
    return m_report.HasFailures() ? ExitCode::DocumentsAtFault : ExitCode::Done;
}

void WatchService::OpenFolders(const std::vector<FolderConfiguration>& folders) {
    m_folders.Open(folders, m_journal.Counts());
    m_isOpen = true;
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
            RemoveOldDocuments(m_folders, m_journal);
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
    const std::set<wxString> paused = m_journal.Paused();
    std::error_code none; // then engines have none either, and say so
    std::vector<fs::path> places = {fs::temp_directory_path(none)};
    if (!m_membership)
        places.push_back(FromArgument(m_configuration.journal).parent_path());
    if (std::exchange(m_mustForget, false))
        m_folders.Forget();
    m_folders.Update(paused, m_configuration.minFree, places);
    for (WatchedFolder& folder : m_folders) {
        if (folder.View().awaitsAdmission) {
            Recover(folder);
            folder.Watcher().Admit();
        }
        if (WatchedFolders::Insert(folder, m_journal))
            m_work.Expect();
    }
}

/// Puts a folder's affairs in order before it is begun with.
void WatchService::Recover(WatchedFolder& folder) {
    if (!Works())
        return;
    if (const std::size_t count = m_work.Recovery().Recover(folder))
        m_reporter.Line(
            wxString::Format(wxPLURAL("%s: recovered %zu document", "%s: recovered %zu documents",
                                      static_cast<unsigned>(count)),
                             folder.Name(), count));
    m_work.Recovery().Sweep(folder.Configuration()->out);
}

/// Whether it converts documents, too.
bool WatchService::Works() const {
    return !m_membership || !m_means.self.finds || m_configuration.jobs > 0;
}

/// Tells others that have the same journal of this machine, hears of them, and takes over what they
/// have lost.
void WatchService::MeetOthers(Clock::time_point now) {
    if (!m_membership || now - m_met < std::min(BetweenMeetings, m_claimant.lease / 3))
        return;
    if (m_means.self.finds) {
        if (m_isOpen)
            m_membership->Announce(m_folders);
    } else if (auto folders = m_membership->News()) {
        m_configuration.folders = std::move(*folders);
        m_isOpen = false;
    }
    if (Works()) {
        m_claimant.cannot = FindUnopenable(m_filters);
        m_work.Recovery().TakeOver(now);
    }
    m_membership->Report(Status());
    m_met = now;
}

WatchStatus WatchService::Status() const {
    WatchStatus status;
    status.started = m_started;
    status.lastPass = m_lastPass;
    if (!m_journalFault.empty())
        status.journalFault = wxString::Format(_("the journal cannot be used: %s"), m_journalFault);
    status.draining = m_isDraining;
    for (const WatchedFolder& folder : m_folders)
        status.folders.push_back(folder.Status());
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
    // Whatever waits then could have been begun, and was not: it waits for another day.
    return !m_isDraining && !m_work.IsBusy() && !m_work.IsPrinting() && m_folders.HaveSettled();
}

void WatchService::OnEnd(const Job& job, const Outcome& outcome) {
    m_report.Tell(job, outcome);
    if (m_audience)
        m_audience->OnEnd(job, outcome);
}
