#include "host/program/documents/Screening.h"

#include "host/program/base/PathText.h"
#include "host/program/documents/FilterCall.h"
#include "host/program/documents/InputCheck.h"
#include "host/program/machine/MissingParts.h"
#include "plugin/ResultCodes.h"

#include <wx/intl.h>

namespace {

wxString UnclaimedReason(const wxString& extension) {
    return extension.empty()
               ? _("a name without an ending; no filter takes it")
               : wxString::Format(_("no filter takes files ending in .%s"), extension);
}

void Refuse(const FilterSet& filters, const Refusal& refusal, Outcome& outcome) {
    outcome.state = refusal.machineAtFault ? State::Failed : State::Refused;
    outcome.code = refusal.code;
    outcome.text = filters.ErrorText(refusal.code);
    outcome.reason = refusal.reason;
    outcome.machineAtFault = refusal.machineAtFault || IsMachineCode(refusal.code);
}

/// Why the filter did not accept the file.
Refusal RefusalFor(const FilterAnswer& answer, const Input& input) {
    if (IsMachineCode(answer.code))
        return {answer.code, MachineReason(ExtensionOf(input))};
    const EngineFailure failure = answer.failure.value_or(EngineFailure());
    if (failure.fault != EngineFailure::Fault::Document) // whatever the document is
        return {ConversionFailed, failure.reason, true};
    if (answer.code == Result::InvalidInputFile)
        return {answer.code, DescribeInvalid(input.full, failure.reason)};
    return {answer.code, failure.reason};
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
        const FilterAnswer answer = CallFilter(Shown(input.given.filename()), [&] {
            Filter::Screened result = filter->Screen(*ToText(input.full));
            screened.item = std::move(result.item);
            return result.code;
        });
        if (!screened.item) {
            Refuse(filters, RefusalFor(answer, input), screened.outcome);
            return screened;
        }
        screened.outcome.text = filter->ErrorText(answer.code);
        screened.filter = filter;
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
    outcome.reason = _("interrupted before its turn came");
    return outcome;
}

wxString MachineReason(const wxString& extension) {
    const std::optional<MissingPart> missing = FindMissingFor(extension);
    return missing ? missing->Text()
                   : _("see `quillon status`; if it finds nothing missing, repair the "
                       "installation of its application");
}
