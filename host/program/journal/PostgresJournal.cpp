#include "host/program/journal/PostgresJournal.h"

#include "host/program/journal/PostgresRow.h"

#include <algorithm>
#include <nlohmann/json.hpp>

using namespace std::chrono_literals;
using nlohmann::json;

namespace {

constexpr auto OffsetHolds = 1min;
constexpr auto TallyGrows = 30s;
constexpr auto CountsHold = std::chrono::milliseconds(1s);

/// What belongs to somebody, as the schema's index has it.
constexpr const char* IsUnderWay =
    "(state IN ('converting', 'submitting', 'printing', 'delivering') "
    "OR (open AND state IN ('finished', 'failed')))";

double SecondsOf(const Claimant& claimant) {
    return static_cast<double>(claimant.lease.count());
}

/// The ending in lower case, without the dot.
std::string KindOf(const std::filesystem::path& source) {
    const wxString ending = wxString::FromUTF8(source.extension().u8string());
    return ending.Mid(1).Lower().utf8_string();
}

/// A job that is to be entered, as the columns of JobsOf.
json JsonOf(const NewJob& job, const PathMap& map) {
    const FileIdentity& file = job.identity;
    return {{"folder", job.folder.utf8_string()},
            {"source", PathText(job.source, map)},
            {"inside", job.inside.utf8_string()},
            {"kind", KindOf(job.source)},
            {"device", static_cast<std::int64_t>(file.device)},
            {"number", static_cast<std::int64_t>(file.number)},
            {"size", file.size},
            {"modified", file.modified},
            {"digest", job.digest},
            {"priority", job.priority}};
}

std::string OrderOf(const JobQuery& query) {
    if (query.newestFirst)
        return "changed DESC, id DESC";
    return query.folder ? "id" : "priority DESC, id";
}

} // namespace

std::unique_ptr<PostgresJournal> PostgresJournal::Open(const std::string& url, Options options,
                                                       Fault& fault) {
    std::unique_ptr<PostgresJournal> journal(new PostgresJournal(url, std::move(options)));
    return journal->m_connection.EnsureOpen(fault) ? std::move(journal) : nullptr;
}

std::size_t PostgresJournal::Insert(const std::vector<NewJob>& jobs) {
    json all = json::array();
    for (const NewJob& job : jobs)
        all.push_back(JsonOf(job, m_options.map));
    ++m_ownChanges;
    return static_cast<std::size_t>(
        m_connection
            .Run("INSERT INTO job (folder, source, inside, kind, device, number, size, modified, "
                 "digest, priority, inserted, due, changed) "
                 "SELECT found.*, now(), now(), now() FROM json_to_recordset($1::json) AS "
                 "found(folder text, source text, inside text, kind text, device bigint, "
                 "number bigint, size bigint, modified bigint, digest text, priority integer) "
                 "ON CONFLICT (folder, size, modified, md5(source)) WHERE open DO NOTHING",
                 all.dump(-1, ' ', false, json::error_handler_t::replace))
            .affected_rows());
}

template <typename Answer>
bool PostgresJournal::Holds(const std::optional<Remembered<Answer>>& remembered) {
    return remembered && Steady::now() < remembered->until && remembered->state == State();
}

std::optional<Job> PostgresJournal::Claim(const std::vector<ClaimableFolder>& folders,
                                          const Claimant& claimant) {
    const ClaimRequest request(folders, claimant);
    const std::string asked = request.folders + request.cannot;
    if (Holds(m_nothing) && m_nothing->answer == asked)
        return std::nullopt;
    const std::uint64_t state = State(); // what is told from here on may be new to the answer
    std::vector<Job> jobs = ReadJobs(ClaimJob(m_connection, request, claimant), m_options.map);
    if (!jobs.empty())
        return std::move(jobs[0]);
    m_nothing = {asked, state, Steady::now() + m_options.memory};
    return std::nullopt;
}

void PostgresJournal::Heartbeat(const Claimant& claimant, const std::vector<std::int64_t>& jobs) {
    if (!jobs.empty())
        m_connection.Run(std::string("UPDATE job SET lease=make_interval(secs => $2), "
                                     "lease_until=now() + make_interval(secs => $2) "
                                     "WHERE claimed_by=$1 AND id = ANY (ARRAY(SELECT "
                                     "json_array_elements_text($3::json)::bigint)) AND ") +
                             IsUnderWay,
                         claimant.name, SecondsOf(claimant), json(jobs).dump());
    AddUpTally();
}

/// One machine does it at a time, at most.
void PostgresJournal::AddUpTally() {
    if (Steady::now() - m_addedUp < TallyGrows)
        return;
    m_addedUp = Steady::now();
    m_connection.Run("WITH turn AS MATERIALIZED "
                     "(SELECT pg_try_advisory_xact_lock(1366641264) AS is_ours), "
                     "added AS (DELETE FROM tally USING turn WHERE is_ours RETURNING tally.*) "
                     "INSERT INTO tally SELECT folder, state, sum(jobs) FROM added "
                     "GROUP BY folder, state HAVING sum(jobs) <> 0");
}

bool PostgresJournal::Commit(const Job& job) {
    ++m_ownChanges;
    return StoreJob(m_connection, m_options.map, job);
}

std::vector<Job> PostgresJournal::TakeOver(const std::vector<wxString>& folders,
                                           const Claimant& claimant) {
    json names = json::array();
    for (const wxString& folder : folders)
        names.push_back(folder.utf8_string());
    ++m_ownChanges;
    std::vector<Job> jobs =
        ReadJobs(m_connection.Run(
                     std::string("WITH abandoned AS (SELECT id AS number_left FROM job WHERE "
                                 "folder = ANY (ARRAY(SELECT json_array_elements_text($1::json))) "
                                 "AND lease_until < now() AND ")
                         .append(IsUnderWay)
                         .append(" ORDER BY id LIMIT 100 FOR UPDATE SKIP LOCKED) "
                                 "UPDATE job SET token=token+1, claimed_by=$2, "
                                 "lease=make_interval(secs => $3), "
                                 "lease_until=now() + make_interval(secs => $3) "
                                 "FROM abandoned WHERE job.id=number_left RETURNING ")
                         .append(PostgresJobColumns),
                     names.dump(), claimant.name, SecondsOf(claimant)),
                 m_options.map);
    std::sort(jobs.begin(), jobs.end(),
              [](const Job& left, const Job& right) { return left.id < right.id; });
    return jobs;
}

std::vector<Job> PostgresJournal::List(const JobQuery& query) {
    const auto state =
        query.state ? std::optional<std::string>(NameOf(*query.state)) : std::nullopt;
    return ReadJobs(m_connection.Run(std::string("SELECT ")
                                         .append(PostgresJobColumns)
                                         .append(" FROM job WHERE ($1::text IS NULL OR folder=$1) "
                                                 "AND ($2::text IS NULL OR state=$2) "
                                                 "AND ($3::boolean IS NULL OR open=$3) "
                                                 "AND ($4::bigint IS NULL OR ended<time_of($4)) "
                                                 "ORDER BY ")
                                         .append(OrderOf(query))
                                         .append(" LIMIT $5"),
                                     query.folder, state, query.open, query.endedBefore,
                                     static_cast<std::int64_t>(query.limit)),
                    m_options.map);
}

std::map<wxString, FolderCounts> PostgresJournal::Counts() {
    if (m_counts && Steady::now() < m_counts->until)
        return m_counts->answer;
    std::map<wxString, FolderCounts> folders;
    const pqxx::result rows = m_connection.Run(
        "SELECT folder, state, sum(jobs), CASE WHEN state='waiting' THEN microseconds_of("
        "(SELECT min(inserted) FROM job WHERE job.state='waiting' AND job.folder=tally.folder)) "
        "END FROM tally GROUP BY folder, state HAVING sum(jobs)>0");
    for (const pqxx::row& each : rows) {
        PostgresRow row(each, m_options.map);
        FolderCounts& counts = folders[row.Text()];
        const JobState state = JobStateOf(row.Text()).value_or(JobState::Failed);
        counts.jobs[state] = static_cast<std::size_t>(row.Integer());
        if (state == JobState::Waiting)
            counts.oldestWaiting = row.Time();
    }
    m_counts = {folders, 0, Steady::now() + std::min(m_options.memory, CountsHold)};
    return folders;
}

bool PostgresJournal::Retry(std::int64_t id) {
    ++m_ownChanges;
    return m_connection
               .Run("UPDATE job SET state='waiting', open=true, attempts=0, deaths=0, "
                    "inserted=now(), due=now(), changed=now(), begun=NULL, ended=NULL, seconds=0, "
                    "workplace='', product='', output='', aside='', print_server='', "
                    "print_queue='', print_number=0, print_uuid='', print_held=false, "
                    "print_message='', fault_blame='', fault='', fault_code=0, fault_advice='', "
                    "text='', token=token+1 "
                    "WHERE id=$1 AND state='failed' AND NOT open AND NOT EXISTS (SELECT FROM job "
                    "AS other WHERE other.open AND other.folder=job.folder AND "
                    "other.size=job.size AND other.modified=job.modified AND "
                    "(other.number=job.number OR other.source=job.source))",
                    id)
               .affected_rows() > 0;
}

void PostgresJournal::Remove(std::int64_t id) {
    ++m_ownChanges;
    m_connection.Run("DELETE FROM job WHERE id=$1", id);
}

void PostgresJournal::SetPaused(const wxString& folder, bool paused) {
    ++m_ownChanges;
    m_connection.Run("INSERT INTO folder (name, paused) VALUES ($1, $2) "
                     "ON CONFLICT (name) DO UPDATE SET paused=excluded.paused",
                     folder, paused);
}

std::set<wxString> PostgresJournal::Paused() {
    if (Holds(m_paused))
        return m_paused->answer;
    const std::uint64_t state = State();
    std::set<wxString> folders;
    for (const pqxx::row& row : m_connection.Run("SELECT name FROM folder WHERE paused"))
        folders.insert(wxString::FromUTF8(row[0].c_str()));
    m_paused = {folders, state, Steady::now() + m_options.memory};
    return folders;
}

/// While the server is away, its clock goes on.
JournalTime PostgresJournal::Now() {
    const Steady::time_point before = Steady::now();
    if (!m_offset || before - m_offsetTaken > OffsetHolds) {
        try {
            const pqxx::result row = m_connection.Run("SELECT microseconds_of(now())");
            const Steady::duration middle =
                before.time_since_epoch() + (Steady::now() - before) / 2;
            m_offset = std::chrono::microseconds(row[0][0].as<std::int64_t>()) - middle;
            m_offsetTaken = before;
        } catch (const JournalError&) {
            if (!m_offset)
                throw;
        }
    }
    return JournalTime(Steady::now().time_since_epoch() + *m_offset);
}
