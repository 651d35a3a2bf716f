#include "host/program/commands/Commands.h"
#include "host/program/documents/Screening.h"
#include "host/program/machine/MachineSetup.h"
#include "host/program/report/OutcomeReport.h"
#include "host/program/settings/Settings.h"
#include "host/program/system/Interruption.h"
#include "host/program/workers/WorkerCount.h"

ExitCode RunScreen(const CommandLine& line, const std::filesystem::path& filtersFolder,
                   Reporter& reporter) {
    FilterSet filters(filtersFolder);
    const std::vector<Input> inputs = ListInputs(line.paths);
    if (const auto end = EndIdleRun(filters, inputs, reporter))
        return *end;
    KeepEngine(line.engineDocuments.value_or(WorthwhileEngineDocuments(inputs.size(), 1)));
    filters.ApplySettings(Settings().Node());
    std::vector<Outcome> outcomes;
    for (const Input& input : inputs) {
        outcomes.push_back(Interruption::Requested() ? NotReached(filters, input)
                                                     : ScreenOnly(filters, input));
        Tell(outcomes.back(), reporter);
    }
    return TellSummary(outcomes, reporter);
}
