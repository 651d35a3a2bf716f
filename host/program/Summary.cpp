#include "host/program/Summary.h"

#include <map>

void Tell(const Outcome& outcome, Reporter& reporter) {
    reporter.Line(LineOf(outcome));
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
