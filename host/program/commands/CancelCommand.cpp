#include "host/program/commands/JournalOptions.h"
#include "host/program/printing/Submission.h"

#include <wx/intl.h>

#include <CLI/CLI.hpp>
#include <algorithm>

namespace {

struct CancelOptions {
    JournalOptions journal;
    std::vector<std::int64_t> ids;
};

/// The document, if a print server has it.
std::optional<Job> FindAtPrinter(std::int64_t id, Journal& journal) {
    for (const JobState state : {JobState::Submitting, JobState::Printing}) {
        JobQuery query;
        query.state = state;
        query.limit = std::numeric_limits<std::int64_t>::max();
        for (const Job& job : journal.List(query))
            if (job.id == id && job.print.number > 0)
                return job;
    }
    return std::nullopt;
}

/// @return why it is not done
std::optional<Fault> Cancel(std::int64_t id, Journal& journal) {
    const std::optional<Job> job = FindAtPrinter(id, journal);
    if (!job)
        return Fault{_("no print server has it; `quillon queue --state printing` shows which can "
                       "be cancelled")};
    const PrintOrder& print = job->print;
    Spooler spooler(print.server);
    if (std::optional<Fault> loss = FindLoss(spooler, print.queue, print.number, print.uuid))
        return loss;
    return spooler.Cancel(print.number);
}

ExitCode Run(const CancelOptions& options, Journal& journal, Reporter& reporter) {
    ExitCode exitCode = ExitCode::Done;
    for (const std::int64_t id : options.ids) {
        const std::optional<Fault> fault = Cancel(id, journal);
        if (fault)
            exitCode =
                std::max(exitCode, fault->blame == Blame::Document ? ExitCode::DocumentsAtFault
                                                                   : ExitCode::MachineAtFault);
        const wxString number = wxString() << id;
        reporter.Line(number + ": " + (fault ? fault->Text() : _("it is cancelled")));
        reporter.Record({{"type", "cancel"},
                         {"id", id},
                         {"done", !fault},
                         {"reason", JsonText(fault ? fault->Text() : wxString())}});
    }
    return exitCode;
}

} // namespace

void AddCancel(CLI::App& program, Command& chosen) {
    const auto given = std::make_shared<CancelOptions>();
    CLI::App& cancel = AddSubcommand(
        program, "cancel", "Cancel documents that a print server has: quillon cancel ID…",
        [&chosen, given] {
            chosen.needsMachine = false;
            chosen.run = [given](const CommonOptions&, Reporter& reporter) {
                return WorkOnJournal(given->journal, reporter,
                                     [&](Journal& journal, const NamedJournal&) {
                                         return Run(*given, journal, reporter);
                                     });
            };
        });
    AddJournalOptions(cancel, given->journal);
    cancel.add_option("ID", given->ids, "Documents, by the numbers that `quillon queue` shows")
        ->required();
}
