#include "host/program/journal/SqliteSchema.h"

#include "host/program/base/PathText.h"

#include <wx/intl.h>

namespace {

/// By these a file says that it is a journal, and of which version's making.
constexpr std::int64_t Application = 0x51754A6F; // "QuJo"
constexpr std::int64_t Version = 1;

// Times are milliseconds since 1970; paths are bytes, UTF-8 as far as they are text; what a number
// does not have is 0, and a text, ''. A job without a fault has no blame.
constexpr const char* Tables = R"(
CREATE TABLE job (
    id INTEGER PRIMARY KEY AUTOINCREMENT,
    folder TEXT NOT NULL,
    source BLOB NOT NULL,
    inside TEXT NOT NULL,
    device INTEGER NOT NULL,
    number INTEGER NOT NULL,
    size INTEGER NOT NULL,
    modified INTEGER NOT NULL,
    priority INTEGER NOT NULL,
    state TEXT NOT NULL DEFAULT 'waiting',
    open INTEGER NOT NULL DEFAULT 1,
    attempts INTEGER NOT NULL DEFAULT 0,
    deaths INTEGER NOT NULL DEFAULT 0,
    inserted INTEGER NOT NULL,
    due INTEGER NOT NULL,
    begun INTEGER NOT NULL DEFAULT 0,
    ended INTEGER NOT NULL DEFAULT 0,
    changed INTEGER NOT NULL,
    seconds REAL NOT NULL DEFAULT 0,
    workplace BLOB NOT NULL DEFAULT x'',
    product TEXT NOT NULL DEFAULT '',
    output BLOB NOT NULL DEFAULT x'',
    aside BLOB NOT NULL DEFAULT x'',
    print_server TEXT NOT NULL DEFAULT '',
    print_queue TEXT NOT NULL DEFAULT '',
    print_number INTEGER NOT NULL DEFAULT 0,
    print_uuid TEXT NOT NULL DEFAULT '',
    print_held INTEGER NOT NULL DEFAULT 0,
    print_message TEXT NOT NULL DEFAULT '',
    fault_blame TEXT NOT NULL DEFAULT '',
    fault TEXT NOT NULL DEFAULT '',
    fault_code INTEGER NOT NULL DEFAULT 0,
    fault_advice TEXT NOT NULL DEFAULT '',
    text TEXT NOT NULL DEFAULT '',
    claimed_by TEXT NOT NULL DEFAULT '',
    token INTEGER NOT NULL DEFAULT 0,
    lease_until INTEGER NOT NULL DEFAULT 0);

CREATE UNIQUE INDEX one_for_a_file ON job (device, number, size, modified) WHERE open = 1;
CREATE INDEX by_arrival ON job (folder, id, due, changed) WHERE state = 'waiting';
CREATE INDEX by_name ON job (folder, source, id, due, changed) WHERE state = 'waiting';
CREATE INDEX by_priority ON job (state, priority DESC, id) WHERE state = 'waiting';
CREATE INDEX by_age ON job (folder, inserted) WHERE state = 'waiting';
CREATE INDEX by_change ON job (state, changed, id);
CREATE INDEX by_end ON job (folder, state, ended);

-- name '' stands for all of them
CREATE TABLE folder (
    name TEXT PRIMARY KEY,
    paused INTEGER NOT NULL DEFAULT 0,
    served INTEGER NOT NULL DEFAULT 0);

-- how many jobs there are: counting a million takes too long
CREATE TABLE tally (
    folder TEXT NOT NULL,
    state TEXT NOT NULL,
    jobs INTEGER NOT NULL,
    PRIMARY KEY (folder, state));
CREATE TRIGGER job_entered AFTER INSERT ON job BEGIN
    INSERT INTO tally VALUES (new.folder, new.state, 1)
        ON CONFLICT (folder, state) DO UPDATE SET jobs = jobs + 1;
END;
CREATE TRIGGER job_removed AFTER DELETE ON job BEGIN
    UPDATE tally SET jobs = jobs - 1 WHERE folder = old.folder AND state = old.state;
END;
CREATE TRIGGER job_moved AFTER UPDATE OF state ON job WHEN new.state <> old.state BEGIN
    UPDATE tally SET jobs = jobs - 1 WHERE folder = old.folder AND state = old.state;
    INSERT INTO tally VALUES (new.folder, new.state, 1)
        ON CONFLICT (folder, state) DO UPDATE SET jobs = jobs + 1;
END;
)";

std::int64_t Number(SqliteDatabase& database, const std::string& query) {
    SqliteStatement statement(database, query);
    return statement.Next() ? statement.Integer() : 0;
}

bool IsEmpty(SqliteDatabase& database) {
    return Number(database, "SELECT COUNT(*) FROM sqlite_master") == 0;
}

void MakeTables(SqliteDatabase& database) {
    SqliteTransaction transaction(database);
    if (!IsEmpty(database)) // another program has been faster
        return;
    database.Run(Tables);
    database.Run("PRAGMA application_id=" + std::to_string(Application));
    database.Run("PRAGMA user_version=" + std::to_string(Version));
    transaction.Commit();
}

/// Has each change on the disk when it is told to be done, and readers not wait for writers.
void UseLog(SqliteDatabase& database) {
    SqliteStatement mode(database, "PRAGMA journal_mode=WAL");
    mode.Next();
    if (mode.Text() != "wal")
        throw SqliteError::Unable("its file system cannot share memory; a local disk can");
    database.Run("PRAGMA synchronous=FULL; PRAGMA cache_size=-8000");
}

} // namespace

bool EnsureSchema(SqliteDatabase& database, const std::filesystem::path& file, bool make,
                  Fault& fault) {
    if (IsEmpty(database)) {
        if (!make) {
            fault = {wxString::Format(_("the journal %s is empty"), Shown(file)), Blame::Machine};
            return false;
        }
        UseLog(database);
        MakeTables(database);
    }
    if (Number(database, "PRAGMA application_id") != Application) {
        fault = {wxString::Format(_("%s is a database, but no journal"), Shown(file)), Blame::Usage,
                 ConversionFailed, _("Name another file")};
        return false;
    }
    if (Number(database, "PRAGMA user_version") > Version) {
        fault = {wxString::Format(_("the journal %s is of a later version of this program"),
                                  Shown(file)),
                 Blame::Usage, ConversionFailed,
                 _("Use that version, or name another file for a new journal")};
        return false;
    }
    UseLog(database);
    return true;
}
