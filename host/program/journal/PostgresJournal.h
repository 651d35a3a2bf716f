#pragma once

#include "host/program/journal/PostgresClaim.h"
#include "host/program/journal/PostgresShared.h"

/// A journal that machines share, on a PostgreSQL server. Its clock is the server's. Each call is
/// one statement, so that it costs one round trip; what is asked again and again is answered
/// without one while nothing is new.
class PostgresJournal : public Journal {
public:
    struct Options {
        JournalNeed need = JournalNeed::Make;
        PathMap map;
        /// For how long an answer holds of which nobody says that it has changed.
        std::chrono::milliseconds memory{5000};
        std::function<std::string()> clock; ///< for tests; see PostgresConnection
    };

    /// @param fault receives why it cannot be opened
    static std::unique_ptr<PostgresJournal> Open(const std::string& url, Options options,
                                                 Fault& fault);

    std::size_t Insert(const std::vector<NewJob>& jobs) override;
    std::optional<Job> Claim(const std::vector<ClaimableFolder>& folders,
                             const Claimant& claimant) override;
    void Heartbeat(const Claimant& claimant, const std::vector<std::int64_t>& jobs) override;
    bool Commit(const Job& job) override;
    std::vector<Job> TakeOver(const std::vector<wxString>& folders,
                              const Claimant& claimant) override;
    std::vector<Job> List(const JobQuery& query) override;
    std::map<wxString, FolderCounts> Counts() override;
    bool Retry(std::int64_t id) override;
    void Remove(std::int64_t id) override;
    void SetPaused(const wxString& folder, bool paused) override;
    std::set<wxString> Paused() override;
    JournalTime Now() override;
    SharedJournal* Shared() override { return &m_shared; }

private:
    using Steady = std::chrono::steady_clock;

    /// An answer, as long as it holds.
    template <typename Answer>
    struct Remembered {
        Answer answer;
        std::uint64_t state = 0; ///< of the journal then; see State
        Steady::time_point until;
    };

    PostgresJournal(const std::string& url, Options options)
        : m_options(std::move(options)), m_connection(url, m_options.need, m_options.clock) {}

    /// Becomes another one when anything may have changed that is remembered.
    std::uint64_t State() { return m_connection.News() + m_ownChanges; }
    template <typename Answer>
    bool Holds(const std::optional<Remembered<Answer>>& remembered);
    void AddUpTally();

    const Options m_options;
    PostgresConnection m_connection;
    PostgresShared m_shared{m_connection};
    std::uint64_t m_ownChanges = 0;
    std::optional<Remembered<std::string>> m_nothing; ///< what was asked for when there was none
    std::optional<Remembered<std::set<wxString>>> m_paused;
    std::optional<Remembered<std::map<wxString, FolderCounts>>> m_counts;
    std::optional<JournalTime::duration> m_offset; ///< of the server's clock to Steady
    Steady::time_point m_offsetTaken;
    Steady::time_point m_addedUp;
};
