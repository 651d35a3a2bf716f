#include "host/program/workers/AssignmentWork.h"

#include "host/program/base/PathText.h"
#include "host/program/documents/Conversion.h"
#include "host/program/documents/Delivery.h"
#include "host/program/system/Digest.h"

#include <wx/intl.h>

namespace fs = std::filesystem;

namespace {

/// @return whether the file is not the one that the assignment means
bool HasChanged(const Assignment& work) {
    std::error_code error;
    if (work.identity && (LookAt(work.input.full, error).identity != *work.identity || error))
        return true;
    return !work.digest.empty() && (DigestOf(work.input.full, error) != work.digest || error);
}

Outcome ChangedOutcome(const Assignment& work) {
    Outcome outcome;
    outcome.input = work.input.given;
    outcome.state = State::Changed;
    return outcome;
}

Fault NotWritten(const std::error_code& error) {
    return {wxString::Format(_("nothing can be written to the output folder: %s"), Because(error)),
            Blame::Machine};
}

/// @return the output, or why there is none
Outcome Copy(const Assignment& work, const FilterSet& filters) {
    Outcome outcome;
    outcome.input = work.input.given;
    const fs::path copy = work.workplace / work.input.full.filename();
    std::error_code error;
    fs::copy_file(work.input.full, copy, error);
    if (error) {
        outcome.End(State::Failed, NotWritten(error), filters.ErrorText(ConversionFailed));
        return outcome;
    }
    outcome.state = State::Converted;
    outcome.made = copy;
    return outcome;
}

} // namespace

Outcome ConvertAssignment(const Assignment& work, const FilterSet& filters,
                          ProgressSink& progress) {
    if (HasChanged(work))
        return ChangedOutcome(work);
    std::error_code error;
    Outcome outcome;
    outcome.input = work.input.given;
    fs::create_directory(work.workplace, error);
    if (!error)
        outcome = work.asItIs ? Copy(work, filters)
                              : ConvertInput(work.input, filters, work.workplace, progress);
    if (!error && !outcome.made.empty())
        error = Product(outcome.made).Sync();
    if (HasChanged(work)) // whatever has been made of it is made of something in between
        return ChangedOutcome(work);
    if (error) {
        outcome.made.clear();
        outcome.End(State::Failed, NotWritten(error), filters.ErrorText(ConversionFailed));
    }
    return outcome;
}
