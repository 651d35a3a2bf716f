#pragma once

#include "host/program/documents/Workplace.h"
#include "host/program/watch/WatchStatus.h"
#include "host/program/watch/Workload.h"
#include "host/program/workers/WorkerPool.h"

/// A document that a watch has in hand.
struct DocumentInHand {
    using Clock = std::chrono::steady_clock;

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

/// The documents that a watch has in hand. They have tickets of its own: a journal that is begun
/// anew gives its numbers again.
class WorkInHand {
public:
    using Ticket = WorkerPool::Ticket;
    using Documents = std::map<Ticket, DocumentInHand>;

    Documents converting; ///< a worker has them
    Documents atPrinter;  ///< or on the way there
    Documents ending;     ///< what is left is the watch's own work

    Ticket NewTicket() { return ++m_last; }

    /// @return null for one that is not among them
    DocumentInHand* Find(const Job& job);

    /// Whether there are ends that do not wait for better times.
    bool HasEndings() const;

    std::vector<Input> InputsOfWorkers() const;
    std::vector<RunningDocument> Running() const;

    /// The numbers of those that are not to be another machine's.
    std::vector<std::int64_t> Claimed() const;

    /// Leaves what is to be delivered yet to the next program.
    void LeaveProducts();

private:
    Ticket m_last = 0;
};
