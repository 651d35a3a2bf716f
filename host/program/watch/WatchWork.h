#pragma once

#include "host/program/filters/FilterSet.h"
#include "host/program/watch/JobPrinting.h"
#include "host/program/watch/WorkEnding.h"
#include "host/program/watch/WorkRecovery.h"

/// What a watch works on: documents are claimed, given to workers, and brought to their ends.
/// Whatever needs the journal may throw JournalError; nothing is lost by that, and the next call
/// goes on where it was.
class WatchWork : private WorkerPool::Owner {
public:
    using Clock = std::chrono::steady_clock;

    struct Means {
        const Claimant& claimant; ///< this program; outlives the work
        std::vector<std::string> workerArguments;
        std::chrono::seconds workerPatience{};
        std::optional<std::string> language;                   ///< where a folder has none
        std::optional<unsigned> engineDocuments;               ///< as many as pay if not given
        unsigned jobs = 0;                                     ///< at a time; as many as pay if 0
        std::function<void(const Job&, const Outcome&)> onEnd; ///< see WorkEnding
        std::function<void(const Job&)> onRetry;
    };

    WatchWork(Means means, Journal& journal, WatchedFolders& folders, const FilterSet& filters);
    /// What is to be delivered yet stays for the next program.
    ~WatchWork() override;
    WatchWork(const WatchWork&) = delete;
    WatchWork& operator=(const WatchWork&) = delete;

    /// Takes in hand what others have left.
    WorkRecovery& Recovery() { return m_recovery; }

    /// Brings one to its end that a worker is done with, or that could not be before. One at a
    /// time: it takes as long as the disk does, and workers are not to wait for that.
    /// @return whether there was one
    bool EndJob();

    /// Takes documents further that come to paper, without waiting for a print server.
    void PrintJobs();

    /// Begins documents, as many as there are workers for.
    void BeginJobs();

    /// When nothing has been under way for some time: lets go of what was kept ready.
    void Rest();

    /// Says that there are more documents than there were.
    void Expect() { m_workload.Expect(); }

    void Heartbeat();

    /// Waits for something to happen, if there is nothing to do.
    void Step();
    /// From any thread.
    void Wake() { m_pool.Wake(); }
    void Close() { m_pool.Close(); }

    /// Whether something is under way that does not wait for better times.
    bool IsBusy() const { return !m_inHand.converting.empty() || m_inHand.HasEndings(); }
    /// Whether documents come to paper, or are to, without anybody's help.
    bool IsPrinting() const { return m_printing.IsBusy(); }
    std::vector<RunningDocument> Running() const { return m_inHand.Running(); }
    /// How many documents could be begun, had they a worker.
    std::size_t Waiting() const { return m_workload.Waiting(); }

private:
    void Begin(Job job, WatchedFolder& folder);
    std::optional<Fault> Prepare(DocumentInHand& document, WatchedFolder& folder,
                                 Assignment& assignment);
    void OnProgress(WorkerPool::Ticket ticket, const wxString& step, int percent) override;
    void OnOutcome(WorkerPool::Ticket ticket, Outcome outcome) override;

    const Means m_means;
    Journal& m_journal;
    WatchedFolders& m_folders;
    const FilterSet& m_filters;
    WorkInHand m_inHand;
    WorkRecovery m_recovery;
    WorkEnding m_ending;
    Workload m_workload;
    WorkerPool m_pool;
    JobPrinting m_printing; // last: it wakes the pool
};
