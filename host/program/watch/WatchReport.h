#pragma once

#include "host/program/documents/Outcome.h"
#include "host/program/report/Reporter.h"
#include "host/program/watch/WatchedFolders.h"

/// Says to people how a watch fares.
class WatchReport {
public:
    /// @param reporter outlives this object
    explicit WatchReport(Reporter& reporter) : m_reporter(reporter) {}

    /// Says which folders are worked for.
    void TellFolders(const WatchedFolders& folders);

    /// Says when a folder's documents wait for something, and when they do no longer.
    void TellObstacles(const WatchedFolders& folders);

    /// Says what has become of a document.
    void Tell(const Job& job, const Outcome& outcome);

    /// At a terminal: how far what came together has come.
    /// @param waiting how many documents could be begun, had they a worker
    void ShowProgress(const WatchStatus& status, std::size_t waiting);

    /// How it fares, in one line.
    wxString Line(const WatchStatus& status) const;

    bool HasFailures() const { return m_failed > 0; }

private:
    using Clock = std::chrono::steady_clock;

    Reporter& m_reporter;
    std::map<wxString, wxString> m_obstacles; ///< that have been told, by folder
    std::size_t m_done = 0;
    std::size_t m_failed = 0;
    Clock::time_point m_burst; ///< since when something has been under way all the time
    std::size_t m_doneBefore = 0;
};
