#include "host/program/base/PathText.h"
#include "host/program/commands/Command.h"
#include "host/program/documents/Workplace.h"
#include "host/program/printserver/JobSettings.h"
#include "host/program/printserver/SpoolerJob.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/system/Interruption.h"
#include "host/program/system/PrintServer.h"
#include "host/program/workers/WorkerPool.h"

#include <wx/intl.h>

#include <cerrno>
#include <fstream>

namespace fs = std::filesystem;

namespace {

/// How long a request to end may go unseen.
constexpr std::chrono::milliseconds BetweenLooks{50};

/// A line of which the spooler keeps what it says: of the printer's state, or of the job.
void Note(const std::string& line) {
    std::fputs((line + '\n').c_str(), stderr);
}

/// What whoever looks at the printer sees as long as no document has come through.
void TellMachine(bool isAtFault) {
    Note(std::string("STATE: ") + (isAtFault ? '+' : '-') + "quillon-machine-error");
}

/// Converts the job's document by a worker: whatever that is doing when the job is cancelled, it
/// can be ended at once, and its engine ends with it.
class Conversion : private WorkerPool::Owner {
public:
    explicit Conversion(const CommonOptions& options)
        : m_pool(WorkerArguments(options), WorkerPatience(options), *this) {}

    /// @return nothing when the program is to end
    std::optional<Outcome> Run(Assignment work) {
        m_pool.Give(0, std::move(work));
        while (!m_outcome && !Interruption::Requested())
            m_pool.Step(BetweenLooks);
        return std::move(m_outcome);
    }

private:
    /// Pages are not told: whoever the output goes to next counts them.
    void OnProgress(WorkerPool::Ticket /*ticket*/, const wxString& /*step*/, int percent) override {
        Note("ATTR: job-media-progress=" + std::to_string(percent));
    }

    void OnOutcome(WorkerPool::Ticket /*ticket*/, Outcome outcome) override {
        m_outcome = std::move(outcome);
    }

    std::optional<Outcome> m_outcome;
    WorkerPool m_pool; // last: what it does at its end, it tells nobody
};

/// The settings of a job, as XML: PostScript, in the way that its options say.
std::optional<std::string> MakeJobSettings(const SpoolerJob& job, Fault& fault) {
    SettingsOptions options;
    options.pdf = false;
    auto assignments =
        SettingsOfJob(PrintServer::ParseOptions(job.options), OptionsOfPrinter(job.ppd), fault);
    if (!assignments)
        return std::nullopt;
    options.assignments = std::move(*assignments);
    const std::optional<Settings> settings = MakeRunSettings(options, fault);
    return settings ? std::optional(settings->Xml()) : std::nullopt;
}

/// Why there is no output, with the document's name in front.
Fault ReasonOf(const Outcome& outcome) {
    Fault fault = outcome.fault.value_or(Fault());
    if (fault.Text().empty())
        fault.what = outcome.text;
    fault.what = Shown(outcome.input.filename()) + ": " + fault.what;
    return fault;
}

/// Hands the output on.
/// @return why it has not gone out
std::optional<Fault> WriteOut(std::ifstream& output) {
    char bytes[1 << 16];
    errno = 0;
    while (output.read(bytes, sizeof bytes), output.gcount() > 0)
        if (std::fwrite(bytes, 1, static_cast<std::size_t>(output.gcount()), stdout) !=
            static_cast<std::size_t>(output.gcount()))
            break;
    if (output.eof() && std::fflush(stdout) == 0)
        return std::nullopt;
    return Fault{wxString::Format(_("the output cannot be handed on: %s"),
                                  Because({errno, std::generic_category()})),
                 Blame::Machine};
}

/// Makes the output.
/// @return open, and in no folder any more; nothing when there is none
std::optional<std::ifstream> Convert(const SpoolerJob& job, const CommonOptions& options,
                                     Reporter& reporter, Fault& fault) {
    Assignment work;
    const std::optional<std::string> settings = MakeJobSettings(job, fault);
    const std::optional<Workplace> workplace =
        settings ? Workplace::CreateTemporary(fault) : std::nullopt;
    const std::optional<fs::path> document =
        workplace ? job.CopyDocument(workplace->Path(), fault) : std::nullopt;
    if (!document)
        return std::nullopt;
    work.input = {*document, *document, true};
    work.workplace = workplace->Path();
    work.settings = *settings;
    work.language = options.language;
    reporter.Line(wxString::Format(_("converting %s"), Shown(document->filename())));
    const std::optional<Outcome> outcome = Conversion(options).Run(std::move(work));
    if (!outcome)
        return std::nullopt;
    if (outcome->made.empty()) {
        fault = ReasonOf(*outcome);
        return std::nullopt;
    }
    return std::ifstream(outcome->made, std::ios::binary);
}

ExitCode RunFilter(const CommonOptions& options, Reporter& reporter) {
    const std::optional<SpoolerJob> job = SpoolerJob::Read(options.spoolerWords);
    if (!job)
        return reporter.Error({_("filter is for print servers, which call it with: job, user, "
                                 "title, copies, options, and a file or standard input"),
                               Blame::Usage});
    Fault fault;
    std::optional<std::ifstream> output = Convert(*job, options, reporter, fault);
    Interruption::EndAtOnce(); // nothing is left that would have to be tidied up
    std::optional<Fault> failure = output ? WriteOut(*output) : fault;
    if (!failure || failure->blame == Blame::Machine)
        TellMachine(failure.has_value());
    return failure ? reporter.Error(*failure) : ExitCode::Done;
}

} // namespace

void AddFilter(CLI::App& program, Command& chosen) {
    AddSubcommand(program, "filter",
                  "Convert a document that a print server spools, which calls this: quillon\n"
                  "filter JOB USER TITLE COPIES OPTIONS [FILE]",
                  [&chosen] {
                      chosen.opensDocuments = true;
                      chosen.isFilter = true;
                      chosen.run = RunFilter;
                  });
}
