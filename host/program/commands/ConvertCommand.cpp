#include "host/program/PathText.h"
#include "host/program/commands/Commands.h"
#include "host/program/documents/Conversion.h"
#include "host/program/documents/Workplace.h"
#include "host/program/report/OutcomeReport.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/system/Interruption.h"

#include <chrono>

namespace {

/// The base name of each input's output, in the inputs' order. Given out beforehand, so that they
/// do not depend on which documents turn out well.
std::vector<wxString> AllotNames(const std::vector<Input>& inputs, const FilterSet& filters,
                                 OutputFolder& outputFolder) {
    std::vector<wxString> names;
    for (const Input& input : inputs) {
        const std::optional<wxString> fileName = ToText(input.full.filename());
        names.push_back(fileName && filters.Claiming(ExtensionOf(input))
                            ? outputFolder.Allot(*fileName)
                            : wxString());
    }
    return names;
}

Outcome ConvertOne(const Input& input, const wxString& baseName, const FilterSet& filters,
                   const OutputFolder& outputFolder, Reporter& reporter) {
    if (Interruption::Requested())
        return NotReached(filters, input);
    const auto start = std::chrono::steady_clock::now();
    const ScreenedInput screened = Screen(filters, input);
    Outcome outcome =
        screened.item ? Convert(screened, outputFolder, baseName, reporter) : screened.outcome;
    outcome.seconds =
        std::chrono::duration<double>(std::chrono::steady_clock::now() - start).count();
    return outcome;
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
        reporter.Error("the output folder " + Shown(FromArgument(line.out)) +
                       " cannot be used: " + fault);
        return ExitCode::WrongUsage;
    }
    Workplace::RemoveAbandoned(outputFolder->Path());
    filters.ApplySettings(settings->Node());
    const std::vector<wxString> names = AllotNames(inputs, filters, *outputFolder);
    std::vector<Outcome> outcomes;
    for (std::size_t i = 0; i < inputs.size(); ++i) {
        outcomes.push_back(ConvertOne(inputs[i], names[i], filters, *outputFolder, reporter));
        Tell(outcomes.back(), reporter);
    }
    return TellSummary(outcomes, reporter);
}
