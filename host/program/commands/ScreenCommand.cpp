#include "host/program/commands/Command.h"
#include "host/program/documents/Screening.h"
#include "host/program/machine/MachineSetup.h"
#include "host/program/report/OutcomeReport.h"
#include "host/program/settings/Settings.h"
#include "host/program/system/Interruption.h"
#include "host/program/workers/WorkerCount.h"

namespace {

using Paths = std::vector<std::string>;

ExitCode Run(const Paths& paths, const CommonOptions& options, Reporter& reporter) {
    FilterSet filters(options.FiltersFolder());
    const std::vector<Input> inputs = ListInputs(paths);
    if (const auto end = EndIdleRun(filters, inputs, reporter))
        return *end;
    KeepEngine(options.engineDocuments.value_or(WorthwhileEngineDocuments(inputs.size(), 1)));
    filters.ApplySettings(Settings().Node());
    std::vector<Outcome> outcomes;
    for (const Input& input : inputs) {
        outcomes.push_back(Interruption::Requested() ? NotReached(filters, input)
                                                     : ScreenOnly(filters, input));
        Tell(outcomes.back(), reporter);
    }
    return TellSummary(outcomes, reporter);
}

} // namespace

void AddScreen(CLI::App& program, Command& chosen) {
    const auto paths = std::make_shared<Paths>();
    CLI::App& screen =
        AddSubcommand(program, "screen",
                      "Show which files can be converted, converting none: quillon screen PATH…",
                      [&chosen, paths] {
                          chosen.opensDocuments = true;
                          chosen.run = [paths](const CommonOptions& options, Reporter& reporter) {
                              return Run(*paths, options, reporter);
                          };
                      });
    AddPaths(screen, *paths);
}
