#include "host/program/base/PathText.h"
#include "host/program/commands/JobReport.h"
#include "host/program/commands/JournalOptions.h"
#include "host/program/commands/MachineReport.h"

#include <wx/intl.h>

#include <CLI/CLI.hpp>

namespace {

struct QueueOptions {
    JournalOptions journal;
    std::optional<std::string> folder;
    std::optional<std::string> state;
    std::size_t limit = 100;
};

/// What people wait for comes last, where it is read first.
constexpr JobState ShownStates[] = {JobState::Waiting,  JobState::Converting, JobState::Submitting,
                                    JobState::Printing, JobState::Delivering, JobState::Finished,
                                    JobState::Failed};

/// Whether a document stays in the state.
bool IsLast(JobState state) {
    return state == JobState::Failed || state == JobState::Archived || state == JobState::Vanished;
}

void TellJobs(const QueueOptions& options, JobState state, Journal& journal, Reporter& reporter) {
    JobQuery query;
    if (options.folder)
        query.folder = wxString::FromUTF8(*options.folder);
    query.state = state;
    query.newestFirst = IsLast(state);
    query.limit = options.limit;
    for (const Job& job : journal.List(query))
        TellJob(job, reporter, journal.Shared() != nullptr);
}

void TellFolders(const QueueOptions& options, Journal& journal, const NamedJournal& named,
                 Reporter& reporter) {
    std::map<wxString, FolderCounts> folders = journal.Counts();
    for (const wxString& name : named.folders)
        folders[name]; // those of which nothing is known yet
    const std::set<wxString> paused = journal.Paused();
    const bool allPaused = paused.count({}) != 0;
    for (const auto& [name, counts] : folders)
        if (!options.folder || name == wxString::FromUTF8(*options.folder))
            TellFolder(name, counts, allPaused || paused.count(name) != 0, reporter);
    if (folders.empty())
        reporter.Line(_("The queue is empty."));
    if (allPaused)
        reporter.Line(_("All folders are paused; `quillon resume` lets them go on."));
}

ExitCode Run(const QueueOptions& options, Journal& journal, const NamedJournal& named,
             Reporter& reporter) {
    if (options.folder)
        if (const auto fault = FindUnknown(wxString::FromUTF8(*options.folder), journal, named))
            return reporter.Error(*fault);
    if (options.state)
        TellJobs(options, *JobStateOf(wxString::FromUTF8(*options.state)), journal, reporter);
    else
        for (const JobState state : ShownStates)
            TellJobs(options, state, journal, reporter);
    TellFolders(options, journal, named, reporter);
    if (SharedJournal* const shared = journal.Shared())
        TellMachines(*shared, reporter);
    return ExitCode::Done;
}

ExitCode TellNone(const NamedJournal& named, Reporter& reporter) {
    reporter.Line(wxString::Format(
        _("The queue is empty: there is no journal %s, so nothing has been found yet."),
        ShownJournal(named.where)));
    return ExitCode::Done;
}

std::string CheckState(const std::string& name) {
    return JobStateOf(wxString::FromUTF8(name)) ? "" : "there is no state " + name;
}

} // namespace

void AddQueue(CLI::App& program, Command& chosen) {
    const auto given = std::make_shared<QueueOptions>();
    CLI::App& queue = AddSubcommand(
        program, "queue", "Show what is waiting, under way and failed of watched folders",
        [&chosen, given] {
            chosen.needsMachine = false;
            chosen.run = [given](const CommonOptions&, Reporter& reporter) {
                return WorkOnJournal(
                    given->journal, reporter,
                    [&](Journal& journal, const NamedJournal& named) {
                        return Run(*given, journal, named, reporter);
                    },
                    [&reporter](const NamedJournal& named) { return TellNone(named, reporter); });
            };
        });
    AddJournalOptions(queue, given->journal);
    queue.add_option("--folder", given->folder, "Only this folder")->type_name("NAME");
    queue
        .add_option("--state", given->state,
                    "Only documents in this state: waiting, converting, submitting,\n"
                    "printing, delivering, finished, archived, failed, vanished")
        ->type_name("STATE")
        ->check(CheckState);
    queue
        .add_option("--limit", given->limit,
                    "At most so many documents of each state, 100 if not given; of those that\n"
                    "have come to their end the newest")
        ->type_name("N");
}
