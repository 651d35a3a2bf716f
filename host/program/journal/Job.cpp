#include "host/program/journal/Job.h"

#include <wx/intl.h>

#include <algorithm>
#include <iterator>

namespace {

/// In the order of the states.
constexpr const char* Names[] = {
    wxTRANSLATE("waiting"),  wxTRANSLATE("converting"), wxTRANSLATE("submitting"),
    wxTRANSLATE("printing"), wxTRANSLATE("delivering"), wxTRANSLATE("finished"),
    wxTRANSLATE("archived"), wxTRANSLATE("failed"),     wxTRANSLATE("vanished"),
};

} // namespace

const char* NameOf(JobState state) {
    return Names[static_cast<int>(state)];
}

std::optional<JobState> JobStateOf(const wxString& name) {
    const auto* const found = std::find(std::begin(Names), std::end(Names), name);
    if (found == std::end(Names))
        return std::nullopt;
    return static_cast<JobState>(found - std::begin(Names));
}
