#include "host/program/report/OutcomeReport.h"

#include "common/WQServices.h"
#include "host/program/base/PathText.h"
#include "host/program/report/Readiness.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <algorithm>
#include <cmath>
#include <map>

namespace {

std::string HexOf(const std::string& bytes) {
    std::string hex;
    for (const char byte : bytes)
        hex += wxString::Format("%02x", static_cast<unsigned char>(byte)).utf8_string();
    return hex;
}

int CodeOf(const Outcome& outcome) {
    return outcome.fault ? outcome.fault->code : 0;
}

wxString ReasonOf(const Outcome& outcome) {
    return outcome.fault ? outcome.fault->Text() : wxString();
}

wxString JobText(const PrintedJob& job) {
    return wxString::Format(_("job %d of %s"), job.number, OneLine(job.queue));
}

Json RecordOf(const PrintedJob& job) {
    return {{"server", JsonText(job.server)}, {"queue", JsonText(job.queue)}, {"job", job.number}};
}

/// The outcome as a line for people.
wxString LineOf(const Outcome& outcome) {
    wxString line = Shown(outcome.input);
    if (!outcome.output.empty())
        line << " -> " << Shown(outcome.output);
    if (outcome.print)
        line << (outcome.output.empty() ? " -> " : ", ") << JobText(*outcome.print);
    line << ": " << wxGetTranslation(NameOf(outcome.state)) << ", " << CodeOf(outcome) << ' '
         << OneLine(outcome.text);
    if (const wxString reason = ReasonOf(outcome); !reason.empty())
        line << " (" << OneLine(reason) << ')';
    if (outcome.seconds)
        line << wxString::Format(", %.2f s", *outcome.seconds);
    return line;
}

wxString TextOf(const FontStandIn& font) {
    return wxString::Format(font.hasSameMetrics ? _("%s (set in %s, of the same widths)")
                                                : _("%s (set in %s)"),
                            OneLine(font.asked), OneLine(font.used));
}

/// A line for people and the log when fonts are not there.
void TellFonts(const Outcome& outcome, Reporter& reporter) {
    if (outcome.fonts.empty())
        return;
    wxString list;
    for (const FontStandIn& font : outcome.fonts)
        list << (list.empty() ? "" : ", ") << TextOf(font);
    const bool runAlike = std::all_of(outcome.fonts.begin(), outcome.fonts.end(),
                                      [](const FontStandIn& font) { return font.hasSameMetrics; });
    SetLevelAndGetLogger(runAlike ? LevelInformation : LevelWarning, __FILE__, __func__, __LINE__)
        << Shown(outcome.input) << ": " << wxString::Format(_("fonts not installed: %s"), list);
    reporter.Line("  " + wxString::Format(_("fonts not installed: %s"), list));
}

Json RecordOf(const std::vector<FontStandIn>& fonts) {
    Json record = Json::array();
    for (const FontStandIn& font : fonts)
        record.push_back({{"asked", JsonText(font.asked)},
                          {"used", JsonText(font.used)},
                          {"sameMetrics", font.hasSameMetrics}});
    return record;
}

bool IsUnfortunate(const Outcome& outcome) {
    return outcome.state == State::Refused || outcome.state == State::Failed;
}

/// What is to blame; null when nothing is.
Json FaultOf(const Outcome& outcome) {
    if (!IsUnfortunate(outcome))
        return {};
    return outcome.fault->blame == Blame::Document ? "document" : "machine";
}

/// The outcome as a record of type "document".
Json RecordOf(const Outcome& outcome) {
    Json record = {{"type", "document"}, {"input", outcome.input.u8string()}};
    if (!IsText(outcome.input)) // JSON is text; this name is not, and must not be lost
        record["inputBytes"] = HexOf(outcome.input.u8string());
    record["output"] = outcome.output.empty() ? Json() : Json(outcome.output.u8string());
    record["print"] = outcome.print ? RecordOf(*outcome.print) : Json();
    record["state"] = NameOf(outcome.state);
    record["code"] = CodeOf(outcome);
    record["text"] = JsonText(outcome.text);
    record["reason"] = JsonText(ReasonOf(outcome));
    record["fault"] = FaultOf(outcome);
    record["fonts"] = RecordOf(outcome.fonts);
    record["seconds"] =
        outcome.seconds ? Json(std::round(*outcome.seconds * 1000.0) / 1000.0) : Json();
    return record;
}

/// How to say how many files have come to a state.
wxString CountFormat(State state, unsigned count) {
    switch (state) {
    case State::Accepted:
        return wxPLURAL("%u accepted", "%u accepted", count);
    case State::Converted:
        return wxPLURAL("%u converted", "%u converted", count);
    case State::Skipped:
        return wxPLURAL("%u skipped", "%u skipped", count);
    case State::Refused:
        return wxPLURAL("%u refused", "%u refused", count);
    case State::Failed:
        return wxPLURAL("%u failed", "%u failed", count);
    case State::NotConverted:
        return wxPLURAL("%u not converted", "%u not converted", count);
    case State::Changed:
        return wxPLURAL("%u changed", "%u changed", count);
    }
    return {};
}

/// The exit code of a command that came to these outcomes: an interruption outweighs a fault of
/// the machine, and that a document's.
ExitCode Verdict(const std::vector<Outcome>& outcomes) {
    const auto any = [&outcomes](auto condition) {
        return std::any_of(outcomes.begin(), outcomes.end(), condition);
    };
    if (any([](const Outcome& outcome) { return outcome.state == State::NotConverted; }))
        return ExitCode::Interrupted;
    if (any([](const Outcome& outcome) {
            return IsUnfortunate(outcome) && outcome.fault->blame != Blame::Document;
        }))
        return ExitCode::MachineAtFault;
    if (any(IsUnfortunate))
        return ExitCode::DocumentsAtFault;
    return ExitCode::Done;
}

} // namespace

void Tell(const Outcome& outcome, Reporter& reporter) {
    const wxString line = LineOf(outcome);
    SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__) << line;
    reporter.Line(line);
    TellFonts(outcome, reporter);
    reporter.Record(RecordOf(outcome));
}

void TellPrint(const Outcome& outcome, bool isOver, const wxString& message, Reporter& reporter) {
    const bool isPrinted = isOver && outcome.state == State::Converted;
    const wxString reason = isOver ? ReasonOf(outcome) : _("the print server still has it");
    wxString line = Shown(outcome.input) + ": ";
    if (isPrinted || !isOver)
        line << JobText(*outcome.print) << ": ";
    line << (isPrinted ? _("printed") : OneLine(reason));
    SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__) << line;
    reporter.Line(line);
    Json record = RecordOf(*outcome.print);
    record["type"] = "print";
    record["input"] = outcome.input.u8string();
    record["state"] = isPrinted ? "printed" : isOver ? "failed" : "open";
    record["reason"] = JsonText(reason);
    record["message"] = JsonText(message);
    reporter.Record(record);
}

ExitCode TellSummary(const std::vector<Outcome>& outcomes, Reporter& reporter,
                     bool wasInterrupted) {
    std::map<State, unsigned> counts;
    for (const Outcome& outcome : outcomes)
        ++counts[outcome.state];
    const ExitCode exitCode = wasInterrupted ? ExitCode::Interrupted : Verdict(outcomes);
    wxString line;
    Json record = {{"type", "summary"}};
    for (const auto& [state, count] : counts) {
        line << (line.empty() ? "" : ", ") << wxString::Format(CountFormat(state, count), count);
        record[NameOf(state)] = count;
    }
    record["exitCode"] = static_cast<int>(exitCode);
    reporter.Line(line + '.');
    reporter.Record(record);
    return exitCode;
}

std::optional<ExitCode> EndIdleRun(const FilterSet& filters, const std::vector<Input>& inputs,
                                   Reporter& reporter) {
    if (const std::optional<Fault> fault = FindMissingFilter(filters))
        return reporter.Error(*fault);
    if (inputs.empty()) {
        reporter.Line(_("Nothing to do: there are no files directly in what was named."));
        return ExitCode::Done;
    }
    return std::nullopt;
}
