#include "host/program/base/PathText.h"
#include "host/program/commands/Command.h"
#include "host/program/documents/Conversion.h"
#include "host/program/documents/Screening.h"
#include "host/program/documents/Workplace.h"
#include "host/program/machine/MachineSetup.h"
#include "host/program/report/OutcomeReport.h"
#include "host/program/report/Progress.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/system/Interruption.h"
#include "host/program/workers/WorkerCount.h"
#include "host/program/workers/WorkerPool.h"

#include <wx/intl.h>

#include <CLI/CLI.hpp>

namespace {

constexpr unsigned MostJobs = 64;
constexpr unsigned WorkerPatience = 60; // seconds

struct ConvertOptions {
    std::vector<std::string> paths;
    std::string out;
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

    ExitCode Finish() const { return TellSummary(m_told, m_reporter); }

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
};

/// The inputs that are a filter's business.
std::vector<Input> Convertible(const Run& run) {
    std::vector<Input> inputs;
    for (std::size_t i = 0; i < run.inputs.size(); ++i)
        if (!run.names[i].empty())
            inputs.push_back(run.inputs[i]);
    return inputs;
}

void ConvertInTurn(const Run& run, Reporter& reporter, OrderedReport& report) {
    for (std::size_t i = 0; i < run.inputs.size(); ++i) {
        const Input& input = run.inputs[i];
        Progress progress(reporter, Shown(input.given.filename()));
        report.Add(i, Interruption::Requested() ? NotReached(run.filters, input)
                                                : ConvertInput(input, run.names[i], run.filters,
                                                               run.outputFolder, progress));
    }
}

/// The arguments that make this program a worker of the run.
std::vector<std::string> WorkerArguments(const CommonOptions& options) {
    std::vector<std::string> arguments = OptionsForWorkers(options);
    arguments.insert(arguments.begin(), "worker");
    return arguments;
}

unsigned EngineDocuments(const CommonOptions& options, std::size_t documents, std::size_t workers) {
    return options.engineDocuments.value_or(WorthwhileEngineDocuments(documents, workers));
}

void ConvertSideBySide(const Run& run, std::size_t workers, const CommonOptions& options,
                       const Settings& settings, Reporter& reporter, OrderedReport& report) {
    std::vector<Assignment> assignments;
    std::vector<std::size_t> numbers; // of the assignments' inputs
    for (std::size_t i = 0; i < run.inputs.size(); ++i) {
        if (run.names[i].empty()) { // there is nothing to convert, nor to wait for
            report.Add(i, Screen(run.filters, run.inputs[i]).outcome);
            continue;
        }
        assignments.push_back({run.inputs[i], run.names[i]});
        numbers.push_back(i);
    }
    WorkerPool pool(WorkerArguments(options),
                    std::chrono::seconds(options.stallSeconds.value_or(WorkerPatience)),
                    {settings.Xml(), run.outputFolder.Path(),
                     EngineDocuments(options, assignments.size(), workers)},
                    run.filters, reporter);
    pool.Run(assignments, workers, [&](std::size_t assignment, Outcome outcome) {
        report.Add(numbers[assignment], std::move(outcome));
    });
}

ExitCode RunConvert(const ConvertOptions& convert, const CommonOptions& options,
                    Reporter& reporter) {
    Fault fault;
    const std::optional<Settings> settings = MakeRunSettings(convert.settings, fault);
    if (!settings)
        return reporter.Error(fault);
    FilterSet filters(options.FiltersFolder());
    const std::vector<Input> inputs = ListInputs(convert.paths);
    if (const auto end = EndIdleRun(filters, inputs, reporter))
        return *end;
    std::optional<OutputFolder> outputFolder = OutputFolder::Open(FromArgument(convert.out), fault);
    if (!outputFolder) {
        fault.what = wxString::Format(_("the output folder %s cannot be used: %s"),
                                      Shown(FromArgument(convert.out)), fault.what);
        return reporter.Error(fault);
    }
    Workplace::RemoveAbandoned(outputFolder->Path());
    const std::vector<wxString> names = AllotNames(inputs, filters, *outputFolder);
    const Run run = {inputs, names, filters, *outputFolder};
    OrderedReport report(inputs.size(), reporter);
    const std::vector<Input> convertible = Convertible(run);
    const std::size_t workers = convert.jobs ? *convert.jobs : WorthwhileWorkers(convertible);
    if (workers > 1) {
        ConvertSideBySide(run, workers, options, *settings, reporter, report);
    } else {
        KeepEngine(EngineDocuments(options, convertible.size(), workers));
        filters.ApplySettings(settings->Node());
        ConvertInTurn(run, reporter, report);
    }
    return report.Finish();
}

void AddSettingsOptions(CLI::App& convert, SettingsOptions& options) {
    convert.add_option("--printer", options.printer, "The printer to print on")->type_name("NAME");
    convert.add_option("--settings", options.file, "A file with settings")->type_name("FILE.xml");
    CLI::Option* const ps = convert.add_flag_callback(
        "--ps", [&options] { options.pdf = false; }, "Make PostScript files only");
    convert
        .add_flag_callback(
            "--pdf", [&options] { options.pdf = true; }, "Make PDF files too")
        ->excludes(ps);
    convert.add_option("--profile", options.profile, "The Distiller profile of the PDF files")
        ->type_name("NAME")
        ->excludes(ps);
}

} // namespace

void AddConvert(CLI::App& program, Command& chosen) {
    CLI::App* const convert =
        program.add_subcommand("convert", "Convert documents: quillon convert PATH… --out DIR");
    const auto given = std::make_shared<ConvertOptions>();
    AddPaths(*convert, given->paths);
    AddRequired(*convert, "-o,--out", "DIR", "The folder for the output", given->out);
    AddSettingsOptions(*convert, given->settings);
    convert
        ->add_option("-j,--jobs", given->jobs,
                     "How many documents to convert at a time; by default as many as pay")
        ->type_name("N")
        ->check(CLI::Range(1U, MostJobs));
    convert
        ->add_option("--set", given->settings.assignments,
                     "One setting; may be given several times")
        ->type_name("KEY=VALUE")
        ->allow_extra_args(false);
    convert->final_callback([&chosen, given] {
        chosen.opensDocuments = true;
        chosen.run = [given](const CommonOptions& options, Reporter& reporter) {
            return RunConvert(*given, options, reporter);
        };
    });
}
