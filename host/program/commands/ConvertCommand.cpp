#include "host/program/base/PathText.h"
#include "host/program/commands/Command.h"
#include "host/program/commands/ConvertPrinting.h"
#include "host/program/documents/Conversion.h"
#include "host/program/documents/Delivery.h"
#include "host/program/documents/OutputFolder.h"
#include "host/program/documents/Screening.h"
#include "host/program/documents/Workplace.h"
#include "host/program/machine/MachineSetup.h"
#include "host/program/report/OutcomeReport.h"
#include "host/program/report/Progress.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/system/Interruption.h"
#include "host/program/workers/WorkerCount.h"
#include "host/program/workers/WorkerPool.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/intl.h>

#include <map>

namespace {

struct ConvertOptions {
    std::vector<std::string> paths;
    std::string out; ///< empty when the output is only printed
    PrintOptions print;
    SettingsOptions settings;
    std::optional<unsigned> jobs; ///< documents at a time; as many as pay when it is not given
};

/// The base name of each input's output, in the inputs' order; empty for those that are no text,
/// or no filter's business. Given out beforehand, so that they do not depend on which documents
/// turn out well.
std::vector<wxString> AllotNames(const std::vector<Input>& inputs, const FilterSet& filters,
                                 OutputFolder& outputFolder) {
    std::vector<wxString> names;
    for (const Input& input : inputs) {
        const bool isText = IsText(input.full) && IsText(input.given);
        names.push_back(isText && filters.Claiming(ExtensionOf(input))
                            ? outputFolder.Allot(ToText(input.full.filename()))
                            : wxString());
    }
    return names;
}

/// Tells the outcomes in the order of the inputs, whichever comes first.
class OrderedReport {
public:
    OrderedReport(std::size_t count, Reporter& reporter) : m_arrived(count), m_reporter(reporter) {}

    void Add(std::size_t number, Outcome outcome) {
        m_arrived[number] = std::move(outcome);
        for (; m_told.size() < m_arrived.size() && m_arrived[m_told.size()];
             m_told.push_back(std::move(*m_arrived[m_told.size()])))
            Tell(*m_arrived[m_told.size()], m_reporter);
    }

    ExitCode Finish(bool wasInterrupted) const {
        return TellSummary(m_told, m_reporter, wasInterrupted);
    }

    std::vector<Outcome>& Told() { return m_told; }

private:
    std::vector<std::optional<Outcome>> m_arrived;
    std::vector<Outcome> m_told;
    Reporter& m_reporter;
};

/// What a run works on.
struct Run {
    const std::vector<Input>& inputs;
    const std::vector<wxString>& names;
    const FilterSet& filters;
    const OutputFolder& outputFolder;
    PrintRun* print = nullptr; ///< null when nothing is printed
    bool keepsOutput = true;   ///< in the folder
};

/// Brings what has been made of a document to where it is to be.
void HandOver(const Run& run, std::size_t number, const Workplace& workplace, Outcome& outcome) {
    if (run.print && outcome.state == State::Converted)
        run.print->Submit(outcome, run.filters.ErrorText(Result::PrintFailed));
    if (run.keepsOutput)
        Deliver(workplace, run.names[number], run.filters, outcome);
    outcome.made.clear();
}

/// The inputs that are a filter's business.
std::vector<Input> Convertible(const Run& run) {
    std::vector<Input> inputs;
    for (std::size_t i = 0; i < run.inputs.size(); ++i)
        if (!run.names[i].empty())
            inputs.push_back(run.inputs[i]);
    return inputs;
}

/// Says in the outcome that nothing can be made of its document.
Outcome WithoutWorkplace(const Run& run, const Input& input, const Fault& fault) {
    Outcome outcome;
    outcome.input = input.given;
    outcome.End(State::Failed, fault, run.filters.ErrorText(fault.code));
    return outcome;
}

Outcome ConvertHere(const Run& run, std::size_t number, Reporter& reporter) {
    const Input& input = run.inputs[number];
    if (run.names[number].empty())
        return Screen(run.filters, input).outcome;
    Fault fault;
    const std::optional<Workplace> workplace = Workplace::Create(run.outputFolder.Path(), fault);
    if (!workplace)
        return WithoutWorkplace(run, input, fault);
    Progress progress(reporter, Shown(input.given.filename()));
    Outcome outcome = ConvertInput(input, run.filters, workplace->Path(), progress);
    HandOver(run, number, *workplace, outcome);
    return outcome;
}

void ConvertInTurn(const Run& run, Reporter& reporter, OrderedReport& report) {
    for (std::size_t i = 0; i < run.inputs.size(); ++i)
        report.Add(i, Interruption::Requested() ? NotReached(run.filters, run.inputs[i])
                                                : ConvertHere(run, i, reporter));
}

unsigned EngineDocuments(const CommonOptions& options, std::size_t documents, std::size_t workers) {
    return options.engineDocuments.value_or(WorthwhileEngineDocuments(documents, workers));
}

/// Has the documents of a run converted by workers.
class ConversionSideBySide : private WorkerPool::Owner {
public:
    /// @param work what all assignments have in common
    ConversionSideBySide(const Run& run, Assignment work, const CommonOptions& options,
                         Reporter& reporter, OrderedReport& report)
        : m_run(run), m_work(std::move(work)), m_reporter(reporter), m_report(report),
          m_pool(WorkerArguments(options), WorkerPatience(options), *this) {}

    void Convert(std::size_t workers) {
        std::size_t next = 0;
        while (next < m_run.inputs.size() || m_pool.Busy() > 0) {
            while (next < m_run.inputs.size() && m_pool.Busy() < workers)
                Begin(next++);
            if (m_pool.Busy() > 0)
                m_pool.Step();
        }
        m_pool.Close();
    }

private:
    struct UnderWay {
        Workplace workplace;
        Progress progress;
    };

    void Begin(std::size_t number) {
        const Input& input = m_run.inputs[number];
        Fault fault;
        if (m_run.names[number].empty()) { // there is nothing to convert
            Add(number, Screen(m_run.filters, input).outcome);
        } else if (Interruption::Requested()) {
            Add(number, NotReached(m_run.filters, input));
        } else if (auto workplace = Workplace::Create(m_run.outputFolder.Path(), fault)) {
            Assignment work = m_work;
            work.input = input;
            work.workplace = workplace->Path();
            m_underWay.try_emplace(number,
                                   UnderWay{std::move(*workplace),
                                            Progress(m_reporter, Shown(input.given.filename()))});
            m_pool.Give(static_cast<WorkerPool::Ticket>(number), std::move(work));
        } else {
            Add(number, WithoutWorkplace(m_run, input, fault));
        }
    }

    void Add(std::size_t number, Outcome outcome) {
        ++m_done;
        m_report.Add(number, std::move(outcome));
    }

    void OnProgress(WorkerPool::Ticket ticket, const wxString& step, int percent) override {
        if (!m_reporter.ForTerminal()) {
            m_underWay.at(static_cast<std::size_t>(ticket)).progress.Report(step, percent);
            return;
        }
        wxString names; // one line is there for all that is under way
        for (const auto& [number, each] : m_underWay)
            names << (names.empty() ? "" : ", ") << each.progress.Document();
        const std::size_t all = m_run.inputs.size();
        const wxString left = TimeLeft(std::chrono::steady_clock::now() - m_begun, m_done, all);
        m_reporter.Passing(ProgressLine(static_cast<int>(m_done * 100 / all),
                                        wxString::Format(_("%zu of %zu"), m_done, all) + "  " +
                                            (left.empty() ? left : left + "  ") + names));
    }

    void OnOutcome(WorkerPool::Ticket ticket, Outcome outcome) override {
        const auto number = static_cast<std::size_t>(ticket);
        const auto underWay = m_underWay.find(number);
        if (outcome.fault && outcome.text.empty())
            outcome.text = m_run.filters.ErrorText(outcome.fault->code);
        HandOver(m_run, number, underWay->second.workplace, outcome);
        m_underWay.erase(underWay);
        Add(number, std::move(outcome));
    }

    const Run& m_run;
    const Assignment m_work;
    Reporter& m_reporter;
    OrderedReport& m_report;
    const std::chrono::steady_clock::time_point m_begun = std::chrono::steady_clock::now();
    std::size_t m_done = 0;
    std::map<std::size_t, UnderWay> m_underWay;
    WorkerPool m_pool;
};

/// The folder that the output goes to: the one that is named, or a temporary one.
std::optional<OutputFolder> OpenOutput(const std::string& named,
                                       std::optional<Workplace>& temporary, Fault& fault) {
    if (named.empty()) {
        temporary = Workplace::CreateTemporary(fault);
        return temporary ? OutputFolder::Open(temporary->Path(), fault) : std::nullopt;
    }
    std::optional<OutputFolder> folder = OutputFolder::Open(FromArgument(named), fault);
    if (!folder)
        fault.what = wxString::Format(_("the output folder %s cannot be used: %s"),
                                      Shown(FromArgument(named)), fault.what);
    return folder;
}

ExitCode RunConvert(const ConvertOptions& convert, const CommonOptions& options,
                    Reporter& reporter) {
    Fault fault;
    std::optional<PrintRun> print;
    if (convert.print.queue && !(print = OpenPrintRun(convert.print, fault)))
        return reporter.Error(fault);
    SettingsOptions wanted = convert.settings;
    if (print && print->WantsPdf())
        wanted.pdf = true;
    const std::optional<Settings> settings = MakeRunSettings(wanted, fault);
    if (!settings)
        return reporter.Error(fault);
    FilterSet filters(options.FiltersFolder());
    const std::vector<Input> inputs = ListInputs(convert.paths);
    if (const auto end = EndIdleRun(filters, inputs, reporter))
        return *end;
    std::optional<Workplace> temporary;
    std::optional<OutputFolder> outputFolder = OpenOutput(convert.out, temporary, fault);
    if (!outputFolder)
        return reporter.Error(fault);
    Workplace::RemoveAbandoned(outputFolder->Path());
    const std::vector<wxString> names = AllotNames(inputs, filters, *outputFolder);
    const Run run = {
        inputs, names, filters, *outputFolder, print ? &*print : nullptr, !convert.out.empty()};
    OrderedReport report(inputs.size(), reporter);
    const std::vector<Input> convertible = Convertible(run);
    const std::size_t workers = convert.jobs ? *convert.jobs : WorthwhileWorkers(convertible);
    const unsigned engineDocuments = EngineDocuments(options, convertible.size(), workers);
    if (workers > 1) {
        Assignment work;
        work.settings = settings->Xml();
        work.language = options.language;
        work.engineDocuments = engineDocuments;
        ConversionSideBySide(run, work, options, reporter, report).Convert(workers);
    } else {
        KeepEngine(engineDocuments);
        filters.ApplySettings(settings->Node());
        ConvertInTurn(run, reporter, report);
    }
    const bool isAllOver =
        !convert.print.waits || AwaitPrints(report.Told(), filters, *print, reporter);
    return report.Finish(!isAllOver);
}

} // namespace

void AddConvert(CLI::App& program, Command& chosen) {
    const auto given = std::make_shared<ConvertOptions>();
    CLI::App& convert = AddSubcommand(
        program, "convert", "Convert documents: quillon convert PATH… --out DIR", [&chosen, given] {
            chosen.opensDocuments = true;
            chosen.run = [given](const CommonOptions& options, Reporter& reporter) {
                return RunConvert(*given, options, reporter);
            };
        });
    AddPaths(convert, given->paths);
    AddOutputOptions(convert, given->out, given->print);
    AddSettingsOptions(convert, given->settings);
    AddJobs(convert, given->jobs);
}
