#pragma once

#include "host/program/watch/QueueMembership.h"
#include "host/program/watch/WatchReport.h"
#include "host/program/watch/WatchWork.h"

/// A watch: finds documents in folders and has them converted, until it is asked to end. What is
/// under way then is finished. Where machines share the journal, one may do the former alone, and
/// others the latter.
class WatchService {
public:
    struct Means {
        /// This program, as it is told to others that have the same journal.
        Machine self;
        wxString finder; ///< see SharedJournal::Announce
        std::vector<std::string> workerArguments;
        std::chrono::seconds workerPatience{};
        std::optional<std::string> language;
        std::optional<unsigned> engineDocuments;
        bool once = false; ///< ends when all that has settled is done
        /// Reads the configuration anew, when somebody asks for that; gives nothing where it cannot
        /// be used, or there is none.
        std::function<std::optional<WatchConfiguration>(Fault&)> reload;
    };

    /// Tells others how the watch is, as long as it lives.
    class Audience {
    public:
        virtual ~Audience() = default;
        virtual void OnEnd(const Job& job, const Outcome& outcome) = 0;
        virtual void OnRetry(const Job& job) = 0;
    };

    WatchService(WatchConfiguration configuration, Means means, Journal& journal,
                 const FilterSet& filters, StatusBoard& board, Reporter& reporter);

    /// @param audience may be null; outlives the service
    void SetAudience(Audience* audience) { m_audience = audience; }

    /// Has the watch look at what somebody has asked for. From any thread.
    void Wake() { m_work.Wake(); }

    /// @return 0 when it was asked to end; with `once` the code that `convert` would end with; 3
    ///     when somebody else watches one of the folders
    ExitCode Run();

private:
    using Clock = std::chrono::steady_clock;

    void OpenFolders(const std::vector<FolderConfiguration>& folders);
    void Reload();
    void Pass();
    void LookAfterFolders();
    void MeetOthers(Clock::time_point now);
    bool Works() const;
    void Recover(WatchedFolder& folder);
    void TellReady();
    WatchStatus Status() const;
    void TellStatus();
    bool IsDone() const;
    bool IsDrained() const;
    ExitCode Verdict() const;
    void OnEnd(const Job& job, const Outcome& outcome);

    WatchConfiguration m_configuration;
    const Means m_means;
    Journal& m_journal;
    const FilterSet& m_filters;
    StatusBoard& m_board;
    Reporter& m_reporter;
    WatchReport m_report;
    Audience* m_audience = nullptr;

    Claimant m_claimant;
    std::unique_ptr<QueueMembership>
        m_membership; ///< null when the journal is this machine's alone
    WatchedFolders m_folders;
    WatchWork m_work;

    const std::chrono::system_clock::time_point m_started;
    Clock::time_point m_lastPass = Clock::now(); ///< that was whole
    Clock::time_point m_heartbeat;
    Clock::time_point m_told;
    Clock::time_point m_met; ///< others
    Clock::time_point m_removedOld;
    wxString m_journalFault;
    bool m_mustForget = false; ///< what was found may not be in the journal
    bool m_isOpen = false;     ///< the folders
    bool m_isDraining = false;
    bool m_isOver = false; ///< with `once`
};
