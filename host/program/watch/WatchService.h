#pragma once

#include "host/program/report/Reporter.h"
#include "host/program/watch/WatchWork.h"

/// A watch: finds documents in folders and has them converted, until it is asked to end. What is
/// under way then is finished.
class WatchService {
public:
    struct Means {
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
    std::optional<Fault> FindOtherWatcher() const;
    void Reload();
    void Pass();
    void LookAfterFolders();
    void Insert(WatchedFolder& folder);
    void TellReady();
    void TellObstacles();
    void TellStatus();
    void ShowProgress(const std::vector<RunningDocument>& running);
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
    Audience* m_audience = nullptr;

    std::set<wxString> m_paused;
    WatchWork::Folders m_folders;
    WatchWork m_work;

    const std::chrono::system_clock::time_point m_started;
    Clock::time_point m_lastPass = Clock::now(); ///< that was whole
    Clock::time_point m_heartbeat;
    Clock::time_point m_told;
    Clock::time_point m_removedOld;
    wxString m_journalFault;
    std::map<wxString, wxString> m_obstacles; ///< that have been told, by folder
    bool m_mustForget = false;                ///< what was found may not be in the journal
    bool m_isDraining = false;
    bool m_isOver = false; ///< with `once`
    std::size_t m_done = 0;
    std::size_t m_failed = 0;
    Clock::time_point m_burst; ///< since when something has been under way all the time
    std::size_t m_doneBefore = 0;
};
