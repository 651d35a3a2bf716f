#pragma once

#include "host/program/watch/WatchedFolder.h"

#include <list>

/// The folders of a watch.
class WatchedFolders {
public:
    /// @param extensions, digests, onNews see WatchedFolder
    WatchedFolders(std::set<std::string> extensions, bool digests, std::function<void()> onNews)
        : m_extensions(std::move(extensions)), m_digests(digests), m_onNews(std::move(onNews)) {}

    /// Watches these and no others.
    /// @param counts the journal's
    void Open(const std::vector<FolderConfiguration>& folders,
              const std::map<wxString, FolderCounts>& counts);
    void Close() { m_folders.clear(); }

    bool IsEmpty() const { return m_folders.empty(); }
    auto begin() { return m_folders.begin(); }
    auto begin() const { return m_folders.begin(); }
    auto end() { return m_folders.end(); }
    auto end() const { return m_folders.end(); }
    /// @return null for one that is not watched any more
    WatchedFolder* Find(const wxString& name);

    /// Looks how they are.
    /// @param places where the machine needs room besides, for any document to be begun
    void Update(const std::set<wxString>& paused, std::uintmax_t minFree,
                const std::vector<std::filesystem::path>& places);
    /// Tells the journal what has settled in one. Throws JournalError.
    /// @return whether anything has
    static bool Insert(WatchedFolder& folder, Journal& journal);
    /// Has all files that are there found anew.
    void Forget();

    /// How many files there are that may still be written to.
    std::size_t Settling() const;
    /// Whether each has been looked at.
    bool HaveBeenSeen() const;
    /// Whether nothing is there that may yet be found, as far as they can be seen.
    bool HaveSettled() const;
    /// Whether documents of one are not begun, and not by a person's wish.
    bool IsAnyBlocked() const;
    /// Why one cannot be watched that somebody has to do something about, such as another watch.
    std::optional<Fault> Misuse() const;

private:
    const std::set<std::string> m_extensions;
    const bool m_digests;
    const std::function<void()> m_onNews;
    std::list<WatchedFolder> m_folders;
};
