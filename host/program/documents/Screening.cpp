#include "host/program/documents/Screening.h"

#include "host/program/base/PathText.h"
#include "host/program/documents/FilterCall.h"
#include "host/program/documents/InputCheck.h"
#include "host/program/machine/MissingParts.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/intl.h>

namespace {

wxString UnclaimedReason(const wxString& extension) {
    return extension.empty()
               ? _("a name without an ending; no filter takes it")
               : wxString::Format(_("no filter takes files ending in .%s"), extension);
}

void Refuse(const FilterSet& filters, const Fault& fault, Outcome& outcome) {
    // Otherwise it has a code of filters, and they, or the host for them, have looked at the file.
    const bool hasFailed = fault.code == ConversionFailed;
    outcome.End(hasFailed ? State::Failed : State::Refused, fault, filters.ErrorText(fault.code));
}

/// Why the filter did not accept the file.
Fault RefusalFor(const FilterAnswer& answer, const Input& input) {
    if (IsMachineCode(answer.code))
        return {MachineReason(ExtensionOf(input)), Blame::Machine, answer.code};
    Fault failure = answer.failure.value_or(Fault());
    if (failure.blame != Blame::Document) // whatever the document is
        return failure;
    if (answer.code == Result::InvalidInputFile)
        return {DescribeInvalid(input, failure.what), Blame::Document, answer.code};
    return {failure.what, Blame::Document, answer.code};
}

} // namespace

ScreenedInput Screen(const FilterSet& filters, const Input& input) {
    ScreenedInput screened;
    screened.outcome.input = input.given;
    const wxString extension = ExtensionOf(input);
    Filter* const filter = filters.Claiming(extension);
    const std::optional<Fault> fault = filter || input.named ? CheckInput(input) : std::nullopt;
    if (fault) {
        Refuse(filters, *fault, screened.outcome);
    } else if (!filter) {
        Refuse(filters, {UnclaimedReason(extension), Blame::Document, Result::InvalidInputFile},
               screened.outcome);
        if (!input.named)
            screened.outcome.state = State::Skipped;
    } else if (!filter->IsReady()) { // which some of its screening does not look at
        Refuse(filters, {MachineReason(extension), Blame::Machine, Result::NotInitialized},
               screened.outcome);
    } else {
        const FilterAnswer answer = CallFilter(Shown(input.given.filename()), [&] {
            Filter::Screened result = filter->Screen(ToText(input.full));
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
    const std::optional<Fault> missing =
        screened.item ? FindMissingFor(ExtensionOf(input)) : std::nullopt;
    if (missing)
        Refuse(filters, *missing, screened.outcome);
    return screened.outcome;
}

Outcome NotReached(const FilterSet& filters, const Input& input) {
    Outcome outcome;
    outcome.input = input.given;
    outcome.End(State::NotConverted,
                {_("interrupted before its turn came"), Blame::Outside, Result::Failure},
                filters.ErrorText(Result::Failure));
    return outcome;
}

wxString MachineReason(const wxString& extension) {
    const std::optional<Fault> missing = FindMissingFor(extension);
    return missing ? missing->Text()
                   : _("see `quillon status`; if it finds nothing missing, repair the "
                       "installation of its application");
}
