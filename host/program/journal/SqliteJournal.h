#pragma once

#include "host/program/journal/Sqlite.h"

#include <functional>

/// A journal in a file of SQLite's. After an error the file is opened anew with the next call, so
/// that one that was removed, or is damaged, is begun anew.
class SqliteJournal : public Journal {
public:
    struct Options {
        JournalNeed need = JournalNeed::Make;
        std::chrono::milliseconds patience{5000}; ///< with another program that has the file
        std::function<JournalTime()> now = std::chrono::system_clock::now;
    };

    /// @param fault receives why it cannot be opened
    static std::unique_ptr<SqliteJournal> Open(const std::filesystem::path& file, Options options,
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
    JournalTime Now() override { return m_options.now(); }

private:
    SqliteJournal(std::filesystem::path file, Options options)
        : m_file(std::move(file)), m_options(std::move(options)) {}

    /// @return whether it is
    bool EnsureOpen(Fault& fault);
    SqliteDatabase& Database();
    /// Closes the file, and throws the error.
    [[noreturn]] void GiveUp(const SqliteError& error);
    template <typename Work>
    auto With(Work work);

    std::filesystem::path m_file;
    Options m_options;
    std::unique_ptr<SqliteDatabase> m_database; ///< null after an error
    bool m_isDamaged = false;
};
