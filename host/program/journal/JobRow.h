#pragma once

#include "host/program/journal/Job.h"

// A job as a row of a journal's table, whatever keeps the journal.

/// As the table has it.
const char* NameOf(Blame blame);

/// @return nothing for the name of none
std::optional<Blame> BlameOf(const std::string& name);

/// @param row gives the columns of a row from the left, one with each call. They are those of
///     JobColumns.
template <typename Row>
Job ReadJob(Row& row) {
    Job job;
    job.id = row.Integer();
    job.folder = row.Text();
    job.source = row.Path();
    job.inside = row.Text();
    job.identity.device = static_cast<std::uint64_t>(row.Integer());
    job.identity.number = static_cast<std::uint64_t>(row.Integer());
    job.identity.size = static_cast<std::uint64_t>(row.Integer());
    job.identity.modified = row.Integer();
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
    job.print.server = row.Text();
    job.print.queue = row.Text();
    job.print.number = static_cast<int>(row.Integer());
    job.print.uuid = row.Text();
    job.print.held = row.Integer() != 0;
    job.print.message = row.Text();
    const std::optional<Blame> blame = BlameOf(row.Bytes());
    Fault fault;
    fault.what = row.Text();
    fault.code = static_cast<int>(row.Integer());
    fault.advice = row.Text();
    if (blame) {
        fault.blame = *blame;
        job.fault = fault;
    }
    job.text = row.Text();
    job.claimedBy = row.Text();
    job.token = row.Integer();
    return job;
}
