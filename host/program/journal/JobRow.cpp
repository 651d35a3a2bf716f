#include "host/program/journal/JobRow.h"

#include <algorithm>
#include <iterator>

namespace {

/// In the order of the values.
constexpr const char* Blames[] = {"document", "machine", "outside", "usage"};

const char* NameOf(Blame blame) {
    return Blames[static_cast<int>(blame)];
}

/// @return nothing for the name of none
std::optional<Blame> BlameOf(const std::string& name) {
    const auto* const found = std::find(std::begin(Blames), std::end(Blames), name);
    if (found == std::end(Blames))
        return std::nullopt;
    return static_cast<Blame>(found - std::begin(Blames));
}

std::optional<Fault> ReadFault(SqliteStatement& row) {
    const std::optional<Blame> blame = BlameOf(row.Bytes());
    Fault fault;
    fault.what = row.Text();
    fault.code = static_cast<int>(row.Integer());
    fault.advice = row.Text();
    if (!blame)
        return std::nullopt;
    fault.blame = *blame;
    return fault;
}

PrintOrder ReadOrder(SqliteStatement& row) {
    PrintOrder order;
    order.server = row.Text();
    order.queue = row.Text();
    order.number = static_cast<int>(row.Integer());
    order.uuid = row.Text();
    order.held = row.Integer() != 0;
    order.message = row.Text();
    return order;
}

FileIdentity ReadIdentity(SqliteStatement& row) {
    FileIdentity identity;
    identity.device = static_cast<std::uint64_t>(row.Integer());
    identity.number = static_cast<std::uint64_t>(row.Integer());
    identity.size = static_cast<std::uint64_t>(row.Integer());
    identity.modified = row.Integer();
    return identity;
}

} // namespace

const char* const JobColumns =
    "id, folder, source, inside, device, number, size, modified, priority, state, open, "
    "attempts, deaths, inserted, due, begun, ended, seconds, workplace, product, output, aside, "
    "print_server, print_queue, print_number, print_uuid, print_held, print_message, fault_blame, "
    "fault, fault_code, fault_advice, text, claimed_by, token";

Job ReadJob(SqliteStatement& row) {
    Job job;
    job.id = row.Integer();
    job.folder = row.Text();
    job.source = row.Path();
    job.inside = row.Text();
    job.identity = ReadIdentity(row);
    job.priority = static_cast<int>(row.Integer());
    job.state = JobStateOf(row.Text()).value_or(JobState::Failed);
    job.open = row.Integer() != 0;
    job.attempts = static_cast<int>(row.Integer());
    job.deaths = static_cast<int>(row.Integer());
    job.inserted = row.Time();
    job.due = row.Time();
    job.begun = row.Time();
    job.ended = row.Time();
    job.seconds = row.Real();
    job.workplace = row.Path();
    job.product = row.Text();
    job.output = row.Path();
    job.aside = row.Path();
    job.print = ReadOrder(row);
    job.fault = ReadFault(row);
    job.text = row.Text();
    job.claimedBy = row.Text();
    job.token = row.Integer();
    return job;
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
