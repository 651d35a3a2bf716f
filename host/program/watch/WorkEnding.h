#pragma once

#include "host/program/report/Texts.h"
#include "host/program/watch/JobDecision.h"
#include "host/program/watch/WatchedFolders.h"
#include "host/program/watch/WorkInHand.h"

/// Brings documents to their ends that workers are done with, or that could not be before. What
/// asks the journal throws JournalError and JobLost, and goes on where it was the next time.
class WorkEnding {
public:
    struct Means {
        std::optional<std::string> language; ///< where a folder has none
        /// Told what has become of a document, when its output is in its place.
        std::function<void(const Job&, const Outcome&)> onEnd;
        std::function<void(const Job&)> onRetry;
    };

    WorkEnding(Means means, Journal& journal, WatchedFolders& folders)
        : m_means(std::move(means)), m_journal(journal), m_folders(folders) {}

    /// Decides what a worker's outcome means for a document and its folder.
    FolderNews Decide(DocumentInHand& document);

    /// Takes the steps that are left, each told to the journal.
    /// @return whether none is left; otherwise it goes to a print server, or waits
    bool Advance(DocumentInHand& document);

private:
    std::optional<Fault> DoLastSteps(DocumentInHand& document);
    void Report(DocumentInHand& document) const;
    const Texts& TextsFor(const FolderConfiguration& folder) const;

    const Means m_means;
    Journal& m_journal;
    WatchedFolders& m_folders;
    const TextsOfLanguages m_texts;
};
