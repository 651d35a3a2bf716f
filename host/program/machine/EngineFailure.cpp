#include "host/program/machine/EngineFailure.h"

#include "host/program/machine/StandInKeys.h"

// After the strings, which it takes for granted.
#include <wx/msw/registry.h>

namespace {

wxString TextOf(const wxRegKey& key, const char* value) {
    wxString text;
    if (key.HasValue(value))
        key.QueryValue(value, text);
    return text;
}

Blame BlameOf(const wxString& name) {
    if (name == "machine")
        return Blame::Machine;
    return name == "outside" ? Blame::Outside : Blame::Document;
}

} // namespace

void ForgetEngineFailure() {
    wxRegKey key(wxRegKey::HKCU, LastFailureKey);
    if (key.Exists())
        key.DeleteSelf();
}

std::optional<Fault> LastEngineFailure() {
    const wxRegKey key(wxRegKey::HKCU, LastFailureKey);
    if (!key.Exists())
        return std::nullopt;
    return Fault{TextOf(key, FailureReasonValue), BlameOf(TextOf(key, FailureFaultValue))};
}
