#pragma once

#include "host/program/documents/Inputs.h"
#include "host/program/journal/Journal.h"

/// A job's document, for a worker.
Input InputOf(const Job& job);

/// How much there is to do, and how it is best done: with how many workers, and with engines that
/// are kept or not.
class Workload {
public:
    using Clock = std::chrono::steady_clock;

    /// @param jobs documents at a time; as many as pay if 0
    /// @param engineDocuments for how many an engine is kept; for as many as pay if not given
    Workload(unsigned jobs, std::optional<unsigned> engineDocuments)
        : m_jobs(jobs), m_givenEngineDocuments(engineDocuments) {}

    /// Says that there are more documents than there were.
    void Expect() { m_known = {}; }

    /// Looks at what is waiting, once a second at most. Throws JournalError.
    void Look(Journal& journal);

    std::size_t Waiting() const { return m_waiting; }

    /// How many documents are best under way now.
    /// @param underWay those that are
    std::size_t WorthwhileJobs(std::vector<Input> underWay) const;

    /// For how many documents an engine is best kept, when another one is begun. Engines are kept
    /// when many documents wait, and from then on; so they are while one comes after the other,
    /// until it is quiet.
    /// @param settling documents that come, too
    unsigned EngineDocuments(const std::vector<Input>& underWay, std::size_t settling);

    /// Whether nothing has been under way for so long that nothing is to be kept ready.
    /// @param isBusy whether something is
    bool IsQuiet(bool isBusy);

private:
    const unsigned m_jobs;
    const std::optional<unsigned> m_givenEngineDocuments;
    std::vector<Input> m_upcoming; ///< some of those that are waiting
    std::size_t m_waiting = 0;
    Clock::time_point m_known;
    Clock::time_point m_lastWork;
    std::size_t m_begun = 0; ///< since it was quiet
    unsigned m_engineDocuments = 1;
};
