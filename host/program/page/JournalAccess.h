#pragma once

#include "host/program/journal/SharedJournal.h"
#include "host/program/page/PageServer.h"

#include <mutex>
#include <optional>

/// What a page shows of the journal.
struct JournalExtract {
    wxString fault; ///< why it cannot be read; or empty. Then all that follows is empty
    std::map<wxString, FolderCounts> counts;
    std::set<wxString> paused;
    std::vector<Job> failed;                      ///< the last ones, newest first
    std::vector<Job> done;                        ///< likewise
    std::optional<std::vector<Machine>> machines; ///< that share the journal, if any do
    std::vector<Job> converting;                  ///< by all of them
};

/// The journal, as requests need it; for any thread. It is read once a second at most, however
/// many ask.
class JournalAccess {
public:
    explicit JournalAccess(JournalOpener open) : m_open(std::move(open)) {}

    JournalExtract Read();

    /// @return why it cannot be done
    std::optional<Fault> Change(const std::function<void(Journal&)>& change);

private:
    std::optional<Fault> With(const std::function<void(Journal&)>& use);

    const JournalOpener m_open;
    std::mutex m_mutex;
    std::unique_ptr<Journal> m_journal; ///< null until it is needed, and after a failure
    JournalExtract m_extract;
    std::optional<std::chrono::steady_clock::time_point> m_readAt;
};

/// Has the documents tried again that have failed; when there are very many, as many as a few
/// seconds allow.
void RetryFailed(Journal& journal, const std::optional<wxString>& folder);
