#include "host/program/documents/Outcome.h"

#include "plugin/ResultCodes.h"

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
