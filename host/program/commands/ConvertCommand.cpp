#include "host/program/PathText.h"
#include "host/program/commands/Commands.h"
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

namespace {

constexpr unsigned WorkerPatience = 60; // seconds

/// The base name of each input's output, in the inputs' order; empty for those that are no text,
/// or no filter's business. Given out beforehand, so that they do not depend on which documents
/// turn out well.
std::vector<wxString> AllotNames(const std::vector<Input>& inputs, const FilterSet& filters,
                                 OutputFolder& outputFolder) {
    std::vector<wxString> names;
    for (const Input& input : inputs) {
        const std::optional<wxString> fileName = ToText(input.full.filename());
        names.push_back(fileName && ToText(input.given) && filters.Claiming(ExtensionOf(input))
                            ? outputFolder.Allot(*fileName)
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
std::vector<std::string> WorkerArguments(const CommandLine& line) {
    std::vector<std::string> arguments = {"worker"};
    const auto pass = [&arguments](const char* option, const std::optional<std::string>& value) {
        if (value)
            arguments.insert(arguments.end(), {option, *value});
    };
    const auto text = [](const std::optional<unsigned>& number) {
        return number ? std::optional(std::to_string(*number)) : std::nullopt;
    };
    pass("--filters", line.filtersFolder);
    pass("--stand-ins", line.standInsFolder);
    pass("--engine-stall", text(line.stallSeconds));
    pass("--engine-limit", text(line.limitSeconds));
    pass("--memory-limit", std::to_string(line.memoryMegabytes));
    pass("--log", line.logFile);
    pass("--lang", line.language);
    if (line.verbose)
        arguments.emplace_back("--verbose");
    return arguments;
}

unsigned EngineDocuments(const CommandLine& line, std::size_t documents, std::size_t workers) {
    return line.engineDocuments.value_or(WorthwhileEngineDocuments(documents, workers));
}

void ConvertSideBySide(const Run& run, std::size_t workers, const CommandLine& line,
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
    WorkerPool pool(WorkerArguments(line),
                    std::chrono::seconds(line.stallSeconds.value_or(WorkerPatience)),
                    {settings.Xml(), run.outputFolder.Path(),
                     EngineDocuments(line, assignments.size(), workers)},
                    run.filters, reporter);
    pool.Run(assignments, workers, [&](std::size_t assignment, Outcome outcome) {
        report.Add(numbers[assignment], std::move(outcome));
    });
}

} // namespace

ExitCode RunConvert(const CommandLine& line, const std::filesystem::path& filtersFolder,
                    Reporter& reporter) {
    Obstacle obstacle;
    const std::optional<Settings> settings = MakeRunSettings(line, obstacle);
    if (!settings) {
        reporter.Error(obstacle.text);
        return obstacle.exitCode;
    }
    FilterSet filters(filtersFolder);
    const std::vector<Input> inputs = ListInputs(line.paths);
    if (const auto end = EndIdleRun(filters, inputs, reporter))
        return *end;
    wxString fault;
    std::optional<OutputFolder> outputFolder = OutputFolder::Open(FromArgument(line.out), fault);
    if (!outputFolder) {
        reporter.Error(wxString::Format(_("the output folder %s cannot be used: %s"),
                                        Shown(FromArgument(line.out)), fault));
        return ExitCode::WrongUsage;
    }
    Workplace::RemoveAbandoned(outputFolder->Path());
    const std::vector<wxString> names = AllotNames(inputs, filters, *outputFolder);
    const Run run = {inputs, names, filters, *outputFolder};
    OrderedReport report(inputs.size(), reporter);
    const std::vector<Input> convertible = Convertible(run);
    const std::size_t workers = line.jobs ? *line.jobs : WorthwhileWorkers(convertible);
    if (workers > 1) {
        ConvertSideBySide(run, workers, line, *settings, reporter, report);
    } else {
        KeepEngine(EngineDocuments(line, convertible.size(), workers));
        filters.ApplySettings(settings->Node());
        ConvertInTurn(run, reporter, report);
    }
    return report.Finish();
}
