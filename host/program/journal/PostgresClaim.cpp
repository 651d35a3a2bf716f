#include "host/program/journal/PostgresClaim.h"

#include "host/program/journal/PostgresRow.h"

#include <nlohmann/json.hpp>

// What is chosen is looked for twice: without a lock to compare the folders, and in the one that
// comes first again, to lock it. Statistics lag behind a queue, which is empty at one moment and
// long at the next: the planner is told to trust the indexes.
//
// What was changed in the future was so before the clock was set back. It may be due only then, and
// is not left to wait for that.
const char* const ClaimFunction = R"(
CREATE FUNCTION claim_job(instant timestamptz, folders json, unable text[], claimant text,
                          duration interval)
RETURNS SETOF job LANGUAGE plpgsql
SET enable_seqscan = off SET enable_bitmapscan = off AS $$
DECLARE
    next record;
    chosen bigint;
BEGIN
    IF EXISTS (SELECT FROM folder WHERE name = '' AND paused) THEN
        RETURN;
    END IF;
    FOR next IN
        SELECT asked.name, asked.by_name
        FROM json_to_recordset(folders) AS asked(name text, by_name boolean)
        LEFT JOIN folder ON folder.name = asked.name
        CROSS JOIN LATERAL (
            (SELECT id, priority, inserted FROM job
             WHERE NOT asked.by_name AND state = 'waiting' AND job.folder = asked.name
                   AND (due <= instant OR changed > instant + interval '1 second')
                   AND kind <> ALL (unable)
             ORDER BY id + 0 LIMIT 1)
            UNION ALL
            (SELECT id, priority, inserted FROM job
             WHERE asked.by_name AND state = 'waiting' AND job.folder = asked.name
                   AND (due <= instant OR changed > instant + interval '1 second')
                   AND kind <> ALL (unable)
             ORDER BY left(source, 500) COLLATE "C", id LIMIT 1)) AS first
        WHERE folder.paused IS NOT TRUE
        ORDER BY first.priority + greatest(0, floor(extract(epoch FROM
                     instant - greatest(first.inserted, folder.served)) / 60)) DESC,
                 folder.served NULLS FIRST, first.id
    LOOP
        IF next.by_name THEN
            SELECT id INTO chosen FROM job
            WHERE state = 'waiting' AND folder = next.name
                  AND (due <= instant OR changed > instant + interval '1 second')
                  AND kind <> ALL (unable)
            ORDER BY left(source, 500) COLLATE "C", id LIMIT 1 FOR UPDATE SKIP LOCKED;
        ELSE
            SELECT id INTO chosen FROM job
            WHERE state = 'waiting' AND folder = next.name
                  AND (due <= instant OR changed > instant + interval '1 second')
                  AND kind <> ALL (unable)
            ORDER BY id + 0 LIMIT 1 FOR UPDATE SKIP LOCKED;
        END IF;
        CONTINUE WHEN chosen IS NULL;
        -- Where another claim notes that just now, it need not be noted twice.
        UPDATE folder
        SET served = greatest(instant, (SELECT max(served) FROM folder) + interval '1 microsecond')
        WHERE name = (SELECT name FROM folder WHERE name = next.name FOR UPDATE SKIP LOCKED);
        IF NOT FOUND AND NOT EXISTS (SELECT FROM folder WHERE name = next.name) THEN
            INSERT INTO folder (name, served)
            VALUES (next.name, greatest(instant, (SELECT max(served) FROM folder)
                                                 + interval '1 microsecond'))
            ON CONFLICT DO NOTHING;
        END IF;
        RETURN QUERY UPDATE job
            SET state = 'converting', attempts = attempts + 1, token = token + 1,
                claimed_by = claimant, begun = instant, changed = instant, lease = duration,
                lease_until = instant + duration
            WHERE id = chosen RETURNING job.*;
        RETURN;
    END LOOP;
END $$;
)";

ClaimRequest::ClaimRequest(const std::vector<ClaimableFolder>& asked, const Claimant& claimant) {
    nlohmann::json all = nlohmann::json::array();
    for (const ClaimableFolder& folder : asked)
        all.push_back({{"name", folder.name.utf8_string()}, {"by_name", folder.byName}});
    folders = all.dump();
    cannot = nlohmann::json(claimant.cannot).dump();
}

pqxx::result ClaimJob(PostgresConnection& connection, const ClaimRequest& request,
                      const Claimant& claimant) {
    return connection.Run(std::string("SELECT ") + PostgresJobColumns +
                              " FROM claim_job(now(), $1::json, ARRAY(SELECT "
                              "json_array_elements_text($2::json)), $3, "
                              "make_interval(secs => $4)) AS job",
                          request.folders, request.cannot, claimant.name,
                          static_cast<double>(claimant.lease.count()));
}
