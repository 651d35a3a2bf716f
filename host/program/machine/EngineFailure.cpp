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

EngineFailure::Fault FaultOf(const wxString& name) {
    if (name == "machine")
        return EngineFailure::Fault::Machine;
    return name == "outside" ? EngineFailure::Fault::Outside : EngineFailure::Fault::Document;
}

} // namespace

void ForgetEngineFailure() {
    wxRegKey key(wxRegKey::HKCU, LastFailureKey);
    if (key.Exists())
        key.DeleteSelf();
}

std::optional<EngineFailure> LastEngineFailure() {
    const wxRegKey key(wxRegKey::HKCU, LastFailureKey);
    if (!key.Exists())
        return std::nullopt;
    return EngineFailure{TextOf(key, FailureReasonValue), FaultOf(TextOf(key, FailureFaultValue))};
}
