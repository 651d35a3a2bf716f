#include "host/program/commands/JournalOptions.h"

#include <wx/intl.h>

#include <CLI/CLI.hpp>
#include <limits>

namespace {

struct RetryOptions {
    JournalOptions journal;
    std::vector<std::int64_t> ids;
    bool failed = false;
    std::optional<std::string> folder;
};

std::vector<std::int64_t> FailedJobs(const std::optional<std::string>& folder, Journal& journal) {
    JobQuery query;
    if (folder)
        query.folder = wxString::FromUTF8(*folder);
    query.state = JobState::Failed;
    query.open = false;
    query.limit = std::numeric_limits<std::int64_t>::max();
    std::vector<std::int64_t> ids;
    for (const Job& job : journal.List(query))
        ids.push_back(job.id);
    return ids;
}

/// @return whether it is
bool TryAgain(std::int64_t id, Journal& journal, Reporter& reporter) {
    const bool done = journal.Retry(id);
    const wxString number = wxString() << id;
    reporter.Line(wxString::Format(
        done ? _("%s: it is tried again")
             : _("%s: it cannot be tried again; `quillon queue --state failed` shows which can"),
        number));
    reporter.Record({{"type", "retry"}, {"id", id}, {"done", done}});
    return done;
}

ExitCode Run(const RetryOptions& options, Journal& journal, const NamedJournal& named,
             Reporter& reporter) {
    if (options.folder)
        if (const auto fault = FindUnknown(wxString::FromUTF8(*options.folder), journal, named))
            return reporter.Error(*fault);
    const std::vector<std::int64_t> ids =
        options.failed ? FailedJobs(options.folder, journal) : options.ids;
    if (ids.empty())
        reporter.Line(_("Nothing to do: no document has failed."));
    bool all = true;
    for (const std::int64_t id : ids)
        all = TryAgain(id, journal, reporter) && all;
    return all ? ExitCode::Done : ExitCode::DocumentsAtFault;
}

ExitCode RunRetry(const RetryOptions& options, Reporter& reporter) {
    if (options.failed == !options.ids.empty())
        return reporter.Error(
            {_("name either documents by the numbers that `quillon queue` shows, or --failed"),
             Blame::Usage});
    return WorkOnJournal(options.journal, reporter,
                         [&](Journal& journal, const NamedJournal& named) {
                             return Run(options, journal, named, reporter);
                         });
}

} // namespace

void AddRetry(CLI::App& program, Command& chosen) {
    const auto given = std::make_shared<RetryOptions>();
    CLI::App& retry = AddSubcommand(
        program, "retry", "Try failed documents again: quillon retry ID…, or --failed",
        [&chosen, given] {
            chosen.needsMachine = false;
            chosen.run = [given](const CommonOptions&, Reporter& reporter) {
                return RunRetry(*given, reporter);
            };
        });
    AddJournalOptions(retry, given->journal);
    retry.add_option("ID", given->ids, "Documents, by the numbers that `quillon queue` shows");
    CLI::Option* const failed = retry.add_flag("--failed", given->failed, "All that have failed");
    retry.add_option("--folder", given->folder, "Of those, the ones of this folder")
        ->type_name("NAME")
        ->needs(failed);
}
