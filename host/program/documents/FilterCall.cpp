#include "host/program/documents/FilterCall.h"

#include "common/WQServices.h"
#include "plugin/ResultCodes.h"

#include <wx/intl.h>

namespace {

FilterAnswer CallOnce(const std::function<int()>& work) {
    ForgetEngineFailure();
    FilterAnswer answer{work(), std::nullopt};
    if (answer.code != Result::Success)
        answer.failure = LastEngineFailure();
    return answer;
}

bool WasEndedFromOutside(const FilterAnswer& answer) {
    return answer.failure && answer.failure->fault == EngineFailure::Fault::Outside;
}

} // namespace

FilterAnswer CallFilter(const wxString& document, const std::function<int()>& work) {
    const FilterAnswer first = CallOnce(work);
    if (!WasEndedFromOutside(first))
        return first;
    SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
        << document << " is tried once more, since " << first.failure->reason;
    FilterAnswer second = CallOnce(work);
    if (WasEndedFromOutside(second))
        second.failure->reason =
            wxString::Format(_("%s, at the second try too"), second.failure->reason);
    return second;
}
