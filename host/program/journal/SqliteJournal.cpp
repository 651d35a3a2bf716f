#include "host/program/journal/SqliteJournal.h"

#include "host/program/journal/SqliteClaim.h"
#include "host/program/journal/SqliteFile.h"
#include "host/program/journal/SqliteRow.h"

#include <algorithm>

namespace {

constexpr const char* IsUnderWay =
    "state IN ('converting', 'submitting', 'printing', 'delivering')";

/// What the query asks for, after WHERE. States and whether a job is open are written out: by them
/// SQLite knows which of its indexes serve.
std::string ConditionsOf(const JobQuery& query) {
    std::string conditions = "TRUE";
    if (query.folder)
        conditions += " AND folder=?1";
    if (query.endedBefore)
        conditions += " AND ended>0 AND ended<?2";
    if (query.state)
        conditions.append(" AND state='").append(NameOf(*query.state)).append("'");
    if (query.open)
        conditions += *query.open ? " AND open=1" : " AND open=0";
    return conditions;
}

std::string OrderOf(const JobQuery& query) {
    if (query.newestFirst)
        return "changed DESC, id DESC";
    return query.folder ? "id" : "priority DESC, id";
}

} // namespace

std::unique_ptr<SqliteJournal> SqliteJournal::Open(const std::filesystem::path& file,
                                                   Options options, Fault& fault) {
    std::unique_ptr<SqliteJournal> journal(new SqliteJournal(file, std::move(options)));
    return journal->EnsureOpen(fault) ? std::move(journal) : nullptr;
}

bool SqliteJournal::EnsureOpen(Fault& fault) {
    if (m_database)
        return true;
    m_database = OpenJournalFile(m_file, m_options.need, m_isDamaged, m_options.patience, fault);
    m_isDamaged = false;
    return m_database != nullptr;
}

SqliteDatabase& SqliteJournal::Database() {
    if (m_database && m_database->IsGone()) {
        m_database.reset();
        throw JournalError("the journal's file was removed");
    }
    // SQLite may go on for a while with what it remembers.
    if (std::error_code error; m_database && std::filesystem::file_size(m_file, error) == 0)
        GiveUp(SqliteError::Damage("the journal's file was emptied"));
    Fault fault;
    if (!EnsureOpen(fault))
        throw JournalError(fault.Text().utf8_string());
    return *m_database;
}

void SqliteJournal::GiveUp(const SqliteError& error) {
    m_isDamaged =
        error.MeansDamage() && m_options.need == JournalNeed::Make && !m_database->IsGone();
    m_database.reset();
    throw error;
}

template <typename Work>
auto SqliteJournal::With(Work work) {
    SqliteDatabase& database = Database();
    try {
        return work(database);
    } catch (const SqliteError& error) {
        GiveUp(error);
    }
}

std::size_t SqliteJournal::Insert(const std::vector<NewJob>& jobs) {
    return With([&](SqliteDatabase& database) {
        SqliteTransaction transaction(database);
        SqliteStatement insert(
            database, "INSERT INTO job (folder, source, inside, device, number, size, modified, "
                      "priority, inserted, due, changed) "
                      "VALUES (?1, ?2, ?3, ?4, ?5, ?6, ?7, ?8, ?9, ?9, ?9) "
                      "ON CONFLICT (device, number, size, modified) WHERE open=1 DO NOTHING");
        const JournalTime now = m_options.now();
        std::size_t entered = 0;
        for (const NewJob& job : jobs) {
            const FileIdentity& file = job.identity;
            insert.Begin(job.folder, job.source, job.inside, file.device, file.number, file.size,
                         file.modified, job.priority, now);
            insert.Run();
            entered += static_cast<std::size_t>(database.Changes());
        }
        transaction.Commit();
        return entered;
    });
}

std::optional<Job> SqliteJournal::Claim(const std::vector<ClaimableFolder>& folders,
                                        const Claimant& claimant) {
    return With([&](SqliteDatabase& database) -> std::optional<Job> {
        SqliteTransaction transaction(database);
        const JournalTime now = m_options.now();
        const std::optional<std::int64_t> id = ChooseJob(database, folders, now);
        if (!id)
            return std::nullopt;
        std::optional<Job> job;
        {
            SqliteStatement row(database,
                                std::string("UPDATE job SET state='converting', "
                                            "attempts=attempts+1, token=token+1, claimed_by=?2, "
                                            "begun=?3, changed=?3, lease_until=?4 WHERE id=?1 "
                                            "RETURNING ") +
                                    JobColumns,
                                *id, claimant.name, now, now + claimant.lease);
            while (row.Next())
                job = ReadJob(row);
        }
        transaction.Commit();
        return job;
    });
}

void SqliteJournal::Heartbeat(const Claimant& claimant,
                              const std::vector<std::int64_t>& /*jobs: nobody else takes them*/) {
    With([&](SqliteDatabase& database) {
        SqliteStatement(database,
                        std::string("UPDATE job SET lease_until=?2 WHERE claimed_by=?1 AND ") +
                            IsUnderWay,
                        claimant.name, m_options.now() + claimant.lease)
            .Run();
    });
}

bool SqliteJournal::Commit(const Job& job) {
    return With([&](SqliteDatabase& database) { return StoreJob(database, job, m_options.now()); });
}

std::vector<Job> SqliteJournal::TakeOver(const std::vector<wxString>& folders,
                                         const Claimant& claimant) {
    return With([&](SqliteDatabase& database) {
        SqliteStatement row(
            database,
            std::string("UPDATE job SET token=token+1, claimed_by=?2, lease_until=?3 WHERE "
                        "folder=?1 AND state IN ('converting', 'submitting', 'printing', "
                        "'delivering', 'finished', 'failed') AND (open=1 OR ")
                .append(IsUnderWay)
                .append(") RETURNING ")
                .append(JobColumns),
            wxString(), claimant.name, m_options.now() + claimant.lease);
        std::vector<Job> jobs;
        for (const wxString& folder : folders) {
            row.Begin(folder, claimant.name, m_options.now() + claimant.lease);
            while (row.Next())
                jobs.push_back(ReadJob(row));
        }
        std::sort(jobs.begin(), jobs.end(),
                  [](const Job& left, const Job& right) { return left.id < right.id; });
        return jobs;
    });
}

std::vector<Job> SqliteJournal::List(const JobQuery& query) {
    return With([&](SqliteDatabase& database) {
        SqliteStatement row(database,
                            std::string("SELECT ")
                                .append(JobColumns)
                                .append(" FROM job WHERE ")
                                .append(ConditionsOf(query))
                                .append(" ORDER BY ")
                                .append(OrderOf(query))
                                .append(" LIMIT ?3"),
                            query.folder.value_or(wxString()),
                            query.endedBefore.value_or(JournalTime()),
                            static_cast<std::uint64_t>(query.limit));
        std::vector<Job> jobs;
        while (row.Next())
            jobs.push_back(ReadJob(row));
        return jobs;
    });
}

std::map<wxString, FolderCounts> SqliteJournal::Counts() {
    return With([&](SqliteDatabase& database) {
        SqliteStatement row(database,
                            "SELECT folder, state, jobs, CASE WHEN state='waiting' THEN "
                            "(SELECT MIN(inserted) FROM job WHERE job.state='waiting' AND "
                            "job.folder=tally.folder) END FROM tally WHERE jobs>0");
        std::map<wxString, FolderCounts> folders;
        while (row.Next()) {
            FolderCounts& counts = folders[row.Text()];
            const JobState state = JobStateOf(row.Text()).value_or(JobState::Failed);
            counts.jobs[state] = static_cast<std::size_t>(row.Integer());
            if (state == JobState::Waiting)
                counts.oldestWaiting = row.Time();
        }
        return folders;
    });
}

bool SqliteJournal::Retry(std::int64_t id) {
    return With([&](SqliteDatabase& database) {
        SqliteStatement(
            database,
            "UPDATE job SET state='waiting', open=1, attempts=0, deaths=0, inserted=?2, due=?2, "
            "changed=?2, begun=0, ended=0, seconds=0, workplace=x'', product='', output=x'', "
            "aside=x'', print_server='', print_queue='', print_number=0, print_uuid='', "
            "print_held=0, print_message='', fault_blame='', fault='', fault_code=0, "
            "fault_advice='', text='', "
            "token=token+1 "
            "WHERE id=?1 AND state='failed' AND open=0 AND NOT EXISTS (SELECT 1 FROM job AS other "
            "WHERE other.open=1 AND other.device=job.device AND other.number=job.number AND "
            "other.size=job.size AND other.modified=job.modified)",
            id, m_options.now())
            .Run();
        return database.Changes() > 0;
    });
}

void SqliteJournal::Remove(std::int64_t id) {
    With([&](SqliteDatabase& database) {
        SqliteStatement(database, "DELETE FROM job WHERE id=?1", id).Run();
    });
}

void SqliteJournal::SetPaused(const wxString& folder, bool paused) {
    With([&](SqliteDatabase& database) {
        SqliteStatement(database,
                        "INSERT INTO folder (name, paused) VALUES (?1, ?2) "
                        "ON CONFLICT (name) DO UPDATE SET paused=excluded.paused",
                        folder, paused)
            .Run();
    });
}

std::set<wxString> SqliteJournal::Paused() {
    return With([&](SqliteDatabase& database) {
        SqliteStatement row(database, "SELECT name FROM folder WHERE paused=1");
        std::set<wxString> folders;
        while (row.Next())
            folders.insert(row.Text());
        return folders;
    });
}
