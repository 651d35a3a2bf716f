#include "host/program/documents/Outcome.h"

#include "plugin/interface/ResultCodes.h"

#include <wx/translation.h>

const char* NameOf(State state) {
    switch (state) {
    case State::Accepted:
        return wxTRANSLATE("accepted");
    case State::Converted:
        return wxTRANSLATE("converted");
    case State::Skipped:
        return wxTRANSLATE("skipped");
    case State::Refused:
        return wxTRANSLATE("refused");
    case State::Failed:
        return wxTRANSLATE("failed");
    case State::NotConverted:
        return wxTRANSLATE("not converted");
    case State::Changed:
        return wxTRANSLATE("changed");
    }
    return "";
}

void Outcome::End(State how, Fault why, const wxString& message) {
    if (IsMachineCode(why.code))
        why.blame = Blame::Machine;
    state = how;
    fault = std::move(why);
    text = message;
}
