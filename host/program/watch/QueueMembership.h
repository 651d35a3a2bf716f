#pragma once

#include "host/program/journal/SharedJournal.h"
#include "host/program/watch/WatchStatus.h"

/// This program among those that work on a shared journal: what it tells them, and hears of them.
/// All that asks the journal throws JournalError.
class QueueMembership {
public:
    /// @param journal outlives this object
    /// @param self what others are told of it; how it fares comes by Report
    QueueMembership(SharedJournal& journal, const Claimant& claimant, Machine self, PathMap map)
        : m_journal(journal), m_claimant(claimant), m_self(std::move(self)), m_map(std::move(map)) {
    }

    /// Tells of folders whose documents this machine finds, where anything has changed.
    /// @return why some cannot be told of
    std::map<wxString, Fault> Announce(const std::vector<FolderConfiguration>& folders);

    /// The folders that others have told of, when they have changed since the last call.
    std::optional<std::vector<FolderConfiguration>> News();

    /// Says how this machine is.
    void Report(const WatchStatus& status);

    /// Says that it ends. What cannot be said now will be seen when its lease has run out.
    void TakeLeave();

private:
    SharedJournal& m_journal;
    const Claimant& m_claimant;
    Machine m_self;
    const PathMap m_map;
    std::vector<AnnouncedFolder> m_announced; ///< last, by this machine
    std::optional<std::vector<AnnouncedFolder>> m_heard;
    wxString m_refused; ///< why some of those cannot be worked for
};

/// Why documents might look another way when a machine works on them than from those that do so
/// now.
/// @param machines all that there are
/// @return nothing when they will not
std::optional<Fault> FindMisfit(const PageMakers& makers, const std::vector<Machine>& machines);
