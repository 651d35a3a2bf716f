#pragma once

#include "host/program/filters/FilterSet.h"
#include "host/program/watch/WatchedFolders.h"
#include "host/program/watch/WorkInHand.h"

/// Takes documents in hand that somebody else has left: an earlier program, or another machine.
/// Whatever asks the journal throws JournalError.
class WorkRecovery {
public:
    using Clock = std::chrono::steady_clock;

    /// @param claimant this program
    /// @param inHand gets the documents; all outlive this object
    WorkRecovery(const Claimant& claimant, Journal& journal, WatchedFolders& folders,
                 const FilterSet& filters, WorkInHand& inHand)
        : m_claimant(claimant), m_journal(journal), m_folders(folders), m_filters(filters),
          m_inHand(inHand) {}

    /// Takes in hand what is left of a folder that is not begun with yet.
    /// @return how many documents there were
    std::size_t Recover(WatchedFolder& folder);

    /// Removes abandoned workplaces, unless the journal knows of an output in one of them.
    void Sweep(const std::filesystem::path& outputFolder);

    /// Takes in hand what other machines have lost, and removes what they have left.
    void TakeOver(Clock::time_point now);

    /// Leaves a document to whoever has claimed it while this program gave no signs, and with it
    /// what has been made of it, if the journal knows of that: that one moves it.
    void Abandon(DocumentInHand& document);

private:
    std::size_t TakeOver(const std::vector<WatchedFolder*>& folders);
    bool Adopt(Job job);
    bool HasJobWithProduct(const std::function<bool(const Job&)>& isMeant);

    const Claimant& m_claimant;
    Journal& m_journal;
    WatchedFolders& m_folders;
    const FilterSet& m_filters;
    WorkInHand& m_inHand;
    Clock::time_point m_swept = Clock::now();
};
