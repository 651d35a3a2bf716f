#include "host/program/journal/PostgresSchema.h"

#include "host/program/journal/PostgresClaim.h"

#include <wx/intl.h>

#include <iterator>

namespace {

/// Only one program changes the schema at a time: "QuJo".
constexpr const char* Turn = "SELECT pg_advisory_xact_lock(1366641263)";

// Paths are as PathText has them; a time that there is none of is NULL, and a text ''. A job
// without a fault has no blame. A row's lease is for how long its claimant has it from now on.
constexpr const char* Tables = R"(
CREATE TABLE quillon_schema (version integer NOT NULL);
INSERT INTO quillon_schema VALUES (0);

CREATE TABLE job (
    id bigint GENERATED ALWAYS AS IDENTITY PRIMARY KEY,
    folder text NOT NULL,
    source text NOT NULL,
    inside text NOT NULL,
    kind text NOT NULL,
    device bigint NOT NULL,
    number bigint NOT NULL,
    size bigint NOT NULL,
    modified bigint NOT NULL,
    digest text NOT NULL,
    priority integer NOT NULL,
    state text NOT NULL DEFAULT 'waiting',
    open boolean NOT NULL DEFAULT true,
    attempts integer NOT NULL DEFAULT 0,
    deaths integer NOT NULL DEFAULT 0,
    inserted timestamptz NOT NULL,
    due timestamptz NOT NULL,
    begun timestamptz,
    ended timestamptz,
    changed timestamptz NOT NULL,
    seconds double precision NOT NULL DEFAULT 0,
    workplace text NOT NULL DEFAULT '',
    product text NOT NULL DEFAULT '',
    output text NOT NULL DEFAULT '',
    aside text NOT NULL DEFAULT '',
    print_server text NOT NULL DEFAULT '',
    print_queue text NOT NULL DEFAULT '',
    print_number integer NOT NULL DEFAULT 0,
    print_uuid text NOT NULL DEFAULT '',
    print_held boolean NOT NULL DEFAULT false,
    print_message text NOT NULL DEFAULT '',
    fault_blame text NOT NULL DEFAULT '',
    fault text NOT NULL DEFAULT '',
    fault_code integer NOT NULL DEFAULT 0,
    fault_advice text NOT NULL DEFAULT '',
    text text NOT NULL DEFAULT '',
    claimed_by text NOT NULL DEFAULT '',
    token bigint NOT NULL DEFAULT 0,
    lease interval NOT NULL DEFAULT '0',
    lease_until timestamptz);

-- Machines see a file's device and number differently. A path may be too long for an index.
CREATE UNIQUE INDEX job_for_a_file ON job (folder, size, modified, md5(source)) WHERE open;
-- id + 0, as otherwise the primary key might be walked along, past all that is done.
CREATE INDEX job_by_arrival ON job (folder, (id + 0)) WHERE state = 'waiting';
CREATE INDEX job_by_name ON job (folder, (left(source, 500)) COLLATE "C", id)
    WHERE state = 'waiting';
CREATE INDEX job_by_priority ON job (priority DESC, id) WHERE state = 'waiting';
CREATE INDEX job_by_age ON job (folder, inserted) WHERE state = 'waiting';
CREATE INDEX job_under_way ON job (folder)
    WHERE state IN ('converting', 'submitting', 'printing', 'delivering')
          OR (open AND state IN ('finished', 'failed'));
CREATE INDEX job_by_change ON job (state, changed, id);
CREATE INDEX job_by_end ON job (folder, state, ended);

-- name '' stands for all of them
CREATE TABLE folder (
    name text PRIMARY KEY,
    paused boolean NOT NULL DEFAULT false,
    served timestamptz);

CREATE TABLE announcement (
    folder text PRIMARY KEY,
    configuration text NOT NULL,
    settings text NOT NULL,
    finder text NOT NULL);

CREATE TABLE machine (
    name text PRIMARY KEY,
    report json NOT NULL,
    started timestamptz NOT NULL,
    seen timestamptz NOT NULL,
    lease interval NOT NULL);

-- How many jobs there are is the sum: counting a million takes too long, and one row for all
-- would have all wait for each other. Now and then the rows are added up.
CREATE TABLE tally (
    folder text NOT NULL,
    state text NOT NULL,
    jobs bigint NOT NULL);

CREATE FUNCTION microseconds_of(instant timestamptz) RETURNS bigint LANGUAGE sql STABLE
    AS 'SELECT (extract(epoch FROM instant) * 1000000)::bigint';
CREATE FUNCTION time_of(microseconds bigint) RETURNS timestamptz LANGUAGE sql STABLE
    AS 'SELECT timestamptz ''1970-01-01 00:00:00+00'' + microseconds * interval ''1 microsecond''';

CREATE FUNCTION tell() RETURNS trigger LANGUAGE plpgsql AS $$
BEGIN
    PERFORM pg_notify('quillon', '');
    RETURN NULL;
END $$;
CREATE TRIGGER paused AFTER INSERT OR UPDATE OF paused ON folder
    FOR EACH ROW EXECUTE FUNCTION tell();
CREATE TRIGGER announced AFTER INSERT OR UPDATE OR DELETE ON announcement
    FOR EACH ROW EXECUTE FUNCTION tell();

-- Who waits for documents hears of new ones; of each step of a document nobody does: telling has
-- all who do it wait for each other.
CREATE FUNCTION count_jobs() RETURNS trigger LANGUAGE plpgsql AS $$
BEGIN
    IF TG_OP = 'INSERT' THEN
        INSERT INTO tally SELECT folder, state, count(*) FROM new_jobs GROUP BY folder, state;
        IF EXISTS (SELECT FROM new_jobs) THEN
            PERFORM pg_notify('quillon', '');
        END IF;
    ELSIF TG_OP = 'DELETE' THEN
        INSERT INTO tally SELECT folder, state, -count(*) FROM old_jobs GROUP BY folder, state;
        IF EXISTS (SELECT FROM old_jobs WHERE open) THEN
            PERFORM pg_notify('quillon', '');
        END IF;
    ELSE
        INSERT INTO tally SELECT folder, state, sum(jobs) FROM
            (SELECT folder, state, 1 AS jobs FROM new_jobs
             UNION ALL SELECT folder, state, -1 FROM old_jobs) AS each
            GROUP BY folder, state HAVING sum(jobs) <> 0;
        IF EXISTS (SELECT FROM new_jobs WHERE state = 'waiting') THEN
            PERFORM pg_notify('quillon', '');
        END IF;
    END IF;
    RETURN NULL;
END $$;
CREATE TRIGGER entered AFTER INSERT ON job REFERENCING NEW TABLE AS new_jobs
    FOR EACH STATEMENT EXECUTE FUNCTION count_jobs();
CREATE TRIGGER removed AFTER DELETE ON job REFERENCING OLD TABLE AS old_jobs
    FOR EACH STATEMENT EXECUTE FUNCTION count_jobs();
CREATE TRIGGER moved AFTER UPDATE ON job REFERENCING OLD TABLE AS old_jobs NEW TABLE AS new_jobs
    FOR EACH STATEMENT EXECUTE FUNCTION count_jobs();
)";

/// What each version has added, from the first one on. What has been released stays as it is.
std::string Migration(std::size_t version) {
    switch (version) {
    case 1:
        return std::string(Tables) + ClaimFunction;
    default:
        return {};
    }
}

constexpr int Version = 1;

/// @return 0 for none
int VersionOf(pqxx::transaction_base& transaction) {
    // Read from the table itself: to_regclass may still know that there was none before the turn.
    const pqxx::row row =
        transaction.exec1("SELECT count(*) FROM pg_class WHERE "
                          "relname = 'quillon_schema' AND pg_table_is_visible(oid)");
    if (row[0].as<int>() == 0)
        return 0;
    return transaction.exec1("SELECT max(version) FROM quillon_schema")[0].as<int>(0);
}

void Migrate(pqxx::connection& connection) {
    pqxx::work transaction(connection);
    transaction.exec(Turn);
    for (int version = VersionOf(transaction) + 1; version <= Version; ++version) {
        transaction.exec(Migration(static_cast<std::size_t>(version)));
        transaction.exec_params("UPDATE quillon_schema SET version = $1", version);
    }
    transaction.commit();
}

wxString NameOf(pqxx::connection& connection) {
    return wxString::FromUTF8(connection.dbname());
}

/// Why the tables were not made.
Fault ForbiddenIn(pqxx::connection& connection) {
    return {wxString::Format(_("the user %s may not make the queue's tables in the database %s"),
                             wxString::FromUTF8(connection.username()), NameOf(connection)),
            Blame::Usage, ConversionFailed,
            _("Have the database's owner run `quillon serve --queue` with its address once; that "
              "makes them")};
}

} // namespace

bool EnsureSchema(pqxx::connection& connection, bool make, Fault& fault) {
    int version = 0;
    {
        pqxx::nontransaction reading(connection);
        version = VersionOf(reading);
    }
    if (version > Version) {
        fault = {wxString::Format(_("the queue in the database %s is of a later version of this "
                                    "program"),
                                  NameOf(connection)),
                 Blame::Usage, ConversionFailed, _("Use that version, or another database")};
        return false;
    }
    if (version == 0 && !make) {
        fault = {wxString::Format(_("the database %s has no queue"), NameOf(connection)),
                 Blame::Usage, ConversionFailed,
                 _("Check the queue's address; watch and serve make a queue")};
        return false;
    }
    try {
        if (version < Version)
            Migrate(connection);
        return true;
    } catch (const pqxx::insufficient_privilege&) {
        fault = ForbiddenIn(connection);
    } catch (const pqxx::sql_error& error) {
        if (error.sqlstate() != "3F000") // the search path names no schema
            throw;
        fault = ForbiddenIn(connection);
    }
    return false;
}
