#include "host/program/Summary.h"

#include "common/WQServices.h"

#include <map>

void Tell(const Outcome& outcome, Reporter& reporter) {
    const wxString line = LineOf(outcome);
    SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__) << line;
    reporter.Line(line);
    reporter.Record(RecordOf(outcome));
}

ExitCode TellSummary(const std::vector<Outcome>& outcomes, Reporter& reporter) {
    std::map<State, int> counts;
    for (const Outcome& outcome : outcomes)
        ++counts[outcome.state];
    const ExitCode exitCode = Verdict(outcomes);
    wxString line;
    Json record = {{"type", "summary"}};
    for (const auto& [state, count] : counts) {
        line << (line.empty() ? "" : ", ") << count << ' ' << NameOf(state);
        record[NameOf(state)] = count;
    }
    record["exitCode"] = static_cast<int>(exitCode);
    reporter.Line(line + '.');
    reporter.Record(record);
    return exitCode;
}
