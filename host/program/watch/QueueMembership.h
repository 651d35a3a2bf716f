#pragma once

#include "host/program/journal/SharedJournal.h"
#include "host/program/watch/WatchedFolders.h"

/// This program among those that work on a shared journal: what it tells them, and hears of them.
/// All that asks the journal throws JournalError.
class QueueMembership {
public:
    /// @param journal outlives this object
    /// @param self what others are told of it; how it fares comes by Report
    /// @param finder see SharedJournal::Announce
    QueueMembership(SharedJournal& journal, const Claimant& claimant, Machine self,
                    const wxString& finder, PathMap map)
        : m_journal(journal), m_claimant(claimant), m_self(std::move(self)), m_finder(finder),
          m_map(std::move(map)) {}

    /// Says that it ends. What cannot be said now will be seen when its lease has run out.
    ~QueueMembership();
    QueueMembership(const QueueMembership&) = delete;
    QueueMembership& operator=(const QueueMembership&) = delete;

    /// Tells of the folders whose documents this machine finds, where anything has changed. Those
    /// that cannot be told of show why.
    void Announce(WatchedFolders& folders);

    /// The folders that others have told of, when they have changed since the last call.
    std::optional<std::vector<FolderConfiguration>> News();

    /// Says how this machine is.
    void Report(const WatchStatus& status);

private:
    SharedJournal& m_journal;
    const Claimant& m_claimant;
    Machine m_self;
    const wxString m_finder;
    const PathMap m_map;
    std::vector<AnnouncedFolder> m_announced; ///< last, by this machine
    std::vector<wxString> m_all; ///< likewise, with those that it does not have at the moment
    std::optional<std::vector<AnnouncedFolder>> m_heard;
    wxString m_refused; ///< why some of those cannot be worked for
};

/// Why documents might look another way when a machine works on them than from those that do so
/// now.
/// @param machines all that there are
/// @return nothing when they will not
std::optional<Fault> FindMisfit(const PageMakers& makers, const std::vector<Machine>& machines);
