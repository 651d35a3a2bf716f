#include "host/program/Outcome.h"

#include "host/program/PathText.h"
#include "host/services/OneLine.h"
#include "plugin/ResultCodes.h"

#include <algorithm>
#include <cmath>

namespace {

std::string HexOf(const std::string& bytes) {
    std::string hex;
    for (const char byte : bytes)
        hex += wxString::Format("%02x", static_cast<unsigned char>(byte)).utf8_string();
    return hex;
}

} // namespace

const char* NameOf(State state) {
    switch (state) {
    case State::Accepted:
        return "accepted";
    case State::Converted:
        return "converted";
    case State::Skipped:
        return "skipped";
    case State::Refused:
        return "refused";
    case State::Failed:
        return "failed";
    case State::NotConverted:
        return "not converted";
    }
    return "";
}

bool IsMachineCode(int code) {
    constexpr int FirstMissingOffice = 1011;
    return code == Result::NotInitialized || code == Result::DistillerNotInstalled ||
           (code >= FirstMissingOffice && code <= Result::PublisherStartFailed) ||
           code == Result::PublisherTooOld;
}

wxString LineOf(const Outcome& outcome) {
    wxString line = Shown(outcome.input);
    if (!outcome.output.empty())
        line << " -> " << Shown(outcome.output);
    line << ": " << NameOf(outcome.state) << ", " << outcome.code << ' ' << OneLine(outcome.text);
    if (!outcome.reason.empty())
        line << " (" << OneLine(outcome.reason) << ')';
    if (outcome.seconds)
        line << wxString::Format(", %.2f s", *outcome.seconds);
    return line;
}

Json RecordOf(const Outcome& outcome) {
    Json record = {{"type", "document"}, {"input", outcome.input.u8string()}};
    if (!ToText(outcome.input)) // JSON is text; this name is not, and must not be lost
        record["inputBytes"] = HexOf(outcome.input.u8string());
    record["output"] = outcome.output.empty() ? Json() : Json(outcome.output.u8string());
    record["state"] = NameOf(outcome.state);
    record["code"] = outcome.code;
    record["text"] = JsonText(outcome.text);
    record["reason"] = JsonText(outcome.reason);
    record["seconds"] =
        outcome.seconds ? Json(std::round(*outcome.seconds * 1000.0) / 1000.0) : Json();
    return record;
}

ExitCode Verdict(const std::vector<Outcome>& outcomes) {
    const auto any = [&outcomes](auto condition) {
        return std::any_of(outcomes.begin(), outcomes.end(), condition);
    };
    if (any([](const Outcome& outcome) { return outcome.state == State::NotConverted; }))
        return ExitCode::Interrupted;
    if (any([](const Outcome& outcome) { return outcome.machineAtFault; }))
        return ExitCode::MachineAtFault;
    if (any([](const Outcome& outcome) {
            return outcome.state == State::Refused || outcome.state == State::Failed;
        }))
        return ExitCode::DocumentsAtFault;
    return ExitCode::Done;
}
