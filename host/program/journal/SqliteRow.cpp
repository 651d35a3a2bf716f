#include "host/program/journal/SqliteRow.h"

#include "host/program/journal/JobRow.h"

const char* const JobColumns =
    "id, folder, source, inside, device, number, size, modified, priority, state, open, "
    "attempts, deaths, inserted, due, begun, ended, seconds, workplace, product, output, aside, "
    "print_server, print_queue, print_number, print_uuid, print_held, print_message, fault_blame, "
    "fault, fault_code, fault_advice, text, claimed_by, token";

Job ReadJob(SqliteStatement& row) {
    return ReadJob<SqliteStatement>(row);
}

bool StoreJob(SqliteDatabase& database, const Job& job, JournalTime now) {
    const Fault fault = job.fault.value_or(Fault());
    SqliteStatement(database,
                    "UPDATE job SET source=?3, priority=?4, state=?5, open=?6, attempts=?7, "
                    "deaths=?8, due=?9, begun=?10, ended=?11, seconds=?12, workplace=?13, "
                    "product=?14, output=?15, fault_blame=?16, fault=?17, fault_code=?18, "
                    "fault_advice=?19, text=?20, aside=?21, changed=?22, "
                    "print_server=?23, print_queue=?24, print_number=?25, print_uuid=?26, "
                    "print_held=?27, print_message=?28 WHERE id=?1 AND token=?2",
                    job.id, job.token, job.source, job.priority, NameOf(job.state), job.open,
                    job.attempts, job.deaths, job.due, job.begun, job.ended, job.seconds,
                    job.workplace, job.product, job.output, job.fault ? NameOf(fault.blame) : "",
                    fault.what, fault.code, fault.advice, job.text, job.aside, now,
                    job.print.server, job.print.queue, job.print.number, job.print.uuid,
                    job.print.held, job.print.message)
        .Run();
    return database.Changes() > 0;
}
