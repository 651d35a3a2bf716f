#pragma once

#include "host/program/journal/Journal.h"
#include "host/program/watch/FolderWatcher.h"
#include "host/program/watch/WatchStatus.h"

#include <memory>

/// A watched folder as the watch deals with it: whether its documents may be begun, and with which
/// settings.
class WatchedFolder {
public:
    using Clock = std::chrono::steady_clock;

    /// @param extensions of documents, in lower case, without dots
    /// @param wasUsed whether the journal has had documents of it
    /// @param digests and onNews see FolderWatcher
    WatchedFolder(const FolderConfiguration& configuration, std::set<std::string> extensions,
                  bool digests, bool wasUsed, std::function<void()> onNews);

    /// Also for documents that are still under way when the folder is watched no more.
    const std::shared_ptr<const FolderConfiguration>& Configuration() const {
        return m_configuration;
    }
    const wxString& Name() const { return m_configuration->name; }
    FolderWatcher& Watcher() { return m_watcher; }

    /// Looks how the folder is.
    /// @param minFree bytes that must be free for its output
    /// @param shortage what the machine lacks elsewhere for any document to be begun
    void Update(const std::set<wxString>& paused, std::uintmax_t minFree,
                const std::optional<Fault>& shortage);

    /// Whether its documents may be begun. Where something was in the way, one may now and then.
    bool MayBegin(Clock::time_point now) const;
    /// Says that one is.
    void Begin() { m_isProbing = m_fault.has_value(); }

    /// Says how its documents come to paper.
    /// @param trouble why they do not
    /// @param isFull as many are on their way as may be
    void ShowPrinting(std::optional<Fault> trouble, bool isFull) {
        m_printTrouble = std::move(trouble);
        m_isPrintingFull = isFull;
    }

    /// Says why other machines cannot be told of it, if that is so.
    void ShowUntold(std::optional<Fault> fault) { m_untold = std::move(fault); }

    /// Says that the machine could not convert a document of it.
    void Block(Fault fault);
    /// Says that it could.
    void Unblock();
    /// Says nothing of either.
    void Free() { m_isProbing = false; }

    /// The settings for its next document, as XML.
    /// @return nothing when they cannot be used; the folder is blocked then
    std::optional<std::string> Settings();

    const FolderWatcher::View& View() const { return m_view; }

    /// Why none of its documents is begun, if that is so for another reason than a person's wish.
    std::optional<Fault> Obstacle() const;

    FolderStatus Status() const;

private:
    const std::shared_ptr<const FolderConfiguration> m_configuration;
    FolderWatcher::View m_view;
    bool m_isPaused = false;
    std::optional<Fault> m_shortage;
    std::optional<Fault> m_fault; ///< of the machine, met by its last document
    Clock::time_point m_probe;    ///< when that may be tried again
    bool m_isProbing = false;
    std::optional<Fault> m_printTrouble;
    bool m_isPrintingFull = false;
    std::optional<Fault> m_untold;

    std::optional<std::string> m_settings;
    FileIdentity m_settingsFile; ///< that they are of
    Clock::time_point m_settingsRead;

    FolderWatcher m_watcher;
};
