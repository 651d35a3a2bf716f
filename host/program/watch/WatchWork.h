#pragma once

#include "host/program/documents/Workplace.h"
#include "host/program/filters/FilterSet.h"
#include "host/program/watch/JobDecision.h"
#include "host/program/watch/JobEnding.h"
#include "host/program/watch/JobPrinting.h"
#include "host/program/watch/WatchedFolder.h"
#include "host/program/watch/Workload.h"
#include "host/program/workers/WorkerPool.h"

#include <deque>
#include <list>

/// What a watch works on: documents are claimed, given to workers, and brought to their ends.
/// Whatever needs the journal may throw JournalError; nothing is lost by that, and the next call
/// goes on where it was.
class WatchWork : private WorkerPool::Owner {
public:
    using Folders = std::list<WatchedFolder>;
    using Clock = std::chrono::steady_clock;

    struct Means {
        const Claimant& claimant; ///< this program; outlives the work
        std::vector<std::string> workerArguments;
        std::chrono::seconds workerPatience{};
        std::optional<std::string> language;     ///< where a folder has none
        std::optional<unsigned> engineDocuments; ///< as many as pay if not given
        unsigned jobs = 0;                       ///< at a time; as many as pay if 0
        /// Told what has become of a document, when its output is in its place.
        std::function<void(const Job&, const Outcome&)> onEnd;
        std::function<void(const Job&)> onRetry;
    };

    WatchWork(Means means, Journal& journal, Folders& folders, const FilterSet& filters);
    /// What is to be delivered yet stays for the next program.
    ~WatchWork() override;
    WatchWork(const WatchWork&) = delete;
    WatchWork& operator=(const WatchWork&) = delete;

    /// Takes over what an earlier program has left of folders, or another machine has lost.
    /// @return how many documents there were
    std::size_t Recover(const std::vector<WatchedFolder*>& folders);

    /// Removes abandoned workplaces, unless the journal knows of an output in one of them.
    void Sweep(const std::filesystem::path& outputFolder);

    /// Brings one to its end that a worker is done with, or that could not be before. One at a
    /// time: it takes as long as the disk does, and workers are not to wait for that.
    /// @return whether there was one
    bool EndJob();

    /// Takes documents further that come to paper, without waiting for a print server.
    void PrintJobs();

    /// Begins documents, as many as there are workers for.
    /// @return whether there may be more, but no worker
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
    bool IsBusy() const;
    /// Whether documents come to paper, or are to, without anybody's help.
    bool IsPrinting() const { return m_printing.IsBusy(); }
    std::vector<RunningDocument> Running() const;
    /// How many documents could be begun, had they a worker.
    std::size_t Waiting() const { return m_workload.Waiting(); }

private:
    struct UnderWay {
        Job job;
        std::shared_ptr<const FolderConfiguration> folder;
        std::optional<Workplace> workplace; ///< until what is in it is delivered
        RunningDocument shown;
        std::optional<Outcome> outcome; ///< when the worker is done
        bool pdfIsForPrinter = false;   ///< the settings do not ask for it
        bool isToBeTold = false;        ///< to the journal, what has been decided
        bool isReported = false;
        Clock::time_point next; ///< when its end may be tried again
    };

    bool HasEndings() const;
    void Begin(Job job, WatchedFolder& folder);
    std::optional<Fault> Prepare(UnderWay& work, WatchedFolder& folder, Assignment& assignment);
    bool Adopt(Job job);
    UnderWay* FindUnderWay(const Job& job);
    Circumstances PresentCircumstances();
    void Decide(UnderWay& work);
    bool End(UnderWay& work);
    void Abandon(UnderWay& work);
    bool HasJobWithProduct(const std::function<bool(const Job&)>& isMeant);
    std::optional<Fault> DoLastSteps(UnderWay& work);
    void Report(UnderWay& work) const;
    WatchedFolder* Find(const wxString& name);
    const Texts& TextsFor(const FolderConfiguration& folder) const;
    std::vector<Input> InputsUnderWay() const;
    unsigned EngineDocuments();

    void OnProgress(WorkerPool::Ticket ticket, const wxString& step, int percent) override;
    void OnOutcome(WorkerPool::Ticket ticket, Outcome outcome) override;

    const Means m_means;
    Journal& m_journal;
    Folders& m_folders;
    const FilterSet& m_filters;
    const TextsOfLanguages m_texts;
    // By tickets of its own: a journal that is begun anew gives its numbers again.
    WorkerPool::Ticket m_lastTicket = 0;
    std::map<WorkerPool::Ticket, UnderWay> m_underWay;  ///< with a worker
    std::map<WorkerPool::Ticket, UnderWay> m_atPrinter; ///< or on the way there
    std::map<WorkerPool::Ticket, UnderWay> m_ending;    ///< no longer with one
    Workload m_workload;
    WorkerPool m_pool;
    JobPrinting m_printing; // last: it wakes the pool
};
