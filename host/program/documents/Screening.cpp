#include "host/program/documents/Screening.h"

#include "host/program/PathText.h"
#include "host/program/documents/InputCheck.h"
#include "host/program/machine/MissingParts.h"
#include "plugin/ResultCodes.h"

namespace {

wxString UnclaimedReason(const wxString& extension) {
    return extension.empty() ? wxString("a name without an ending; no filter takes it")
                             : "no filter takes files ending in ." + extension;
}

void Refuse(const FilterSet& filters, const Refusal& refusal, Outcome& outcome) {
    outcome.state = State::Refused;
    outcome.code = refusal.code;
    outcome.text = filters.ErrorText(refusal.code);
    outcome.reason = refusal.reason;
    outcome.machineAtFault = IsMachineCode(refusal.code);
}

wxString ReasonFor(int code, const Input& input) {
    if (IsMachineCode(code))
        return MachineReason(ExtensionOf(input));
    return code == Result::InvalidInputFile ? DescribeInvalid(input.full) : wxString();
}

} // namespace

ScreenedInput Screen(const FilterSet& filters, const Input& input) {
    ScreenedInput screened;
    screened.outcome.input = input.given;
    const wxString extension = ExtensionOf(input);
    Filter* const filter = filters.Claiming(extension);
    const std::optional<Refusal> fault =
        filter || input.named ? CheckInput(input.full) : std::nullopt;
    if (fault) {
        Refuse(filters, *fault, screened.outcome);
    } else if (!filter) {
        Refuse(filters, {Result::InvalidInputFile, UnclaimedReason(extension)}, screened.outcome);
        if (!input.named)
            screened.outcome.state = State::Skipped;
    } else if (!filter->IsReady()) { // which some of its screening does not look at
        Refuse(filters, {Result::NotInitialized, MachineReason(extension)}, screened.outcome);
    } else {
        Filter::Screened answer = filter->Screen(*ToText(input.full));
        if (!answer.item) {
            Refuse(filters, {answer.code, ReasonFor(answer.code, input)}, screened.outcome);
            return screened;
        }
        screened.outcome.text = filter->ErrorText(answer.code);
        screened.filter = filter;
        screened.item = std::move(answer.item);
    }
    return screened;
}

Outcome ScreenOnly(const FilterSet& filters, const Input& input) {
    ScreenedInput screened = Screen(filters, input);
    const std::optional<MissingPart> missing =
        screened.item ? FindMissingFor(ExtensionOf(input)) : std::nullopt;
    if (missing)
        Refuse(filters, {missing->code, missing->Text()}, screened.outcome);
    return screened.outcome;
}

Outcome NotReached(const FilterSet& filters, const Input& input) {
    Outcome outcome;
    outcome.input = input.given;
    outcome.state = State::NotConverted;
    outcome.code = Result::Failure;
    outcome.text = filters.ErrorText(Result::Failure);
    outcome.reason = "interrupted before its turn came";
    return outcome;
}

wxString MachineReason(const wxString& extension) {
    const std::optional<MissingPart> missing = FindMissingFor(extension);
    return missing ? missing->Text()
                   : wxString("see `quillon status`; if it finds nothing missing, repair the "
                              "installation of its application");
}
