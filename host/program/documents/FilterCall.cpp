#include "host/program/documents/FilterCall.h"

#include "common/WQServices.h"
#include "host/program/base/Reasons.h"
#include "host/program/machine/EngineFailure.h"
#include "host/program/machine/FontStandIns.h"
#include "plugin/interface/ResultCodes.h"

#include <wx/intl.h>

namespace {

FilterAnswer CallOnce(const std::function<int()>& work) {
    ForgetEngineFailure();
    ForgetFontStandIns();
    FilterAnswer answer{work(), std::nullopt};
    if (answer.code != Result::Success)
        answer.failure = LastEngineFailure();
    return answer;
}

bool WasEndedFromOutside(const FilterAnswer& answer) {
    return answer.failure && answer.failure->blame == Blame::Outside;
}

} // namespace

FilterAnswer CallFilter(const wxString& document, const std::function<int()>& work) {
    FilterAnswer answer = CallOnce(work);
    const bool isSecond = WasEndedFromOutside(answer);
    if (isSecond) {
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << document << " is tried once more, since " << answer.failure->what;
        answer = CallOnce(work);
    }
    if (answer.failure)
        answer.failure->what = TranslateReason(answer.failure->what);
    if (isSecond && WasEndedFromOutside(answer))
        answer.failure->what =
            wxString::Format(_("%s, at the second try too"), answer.failure->what);
    return answer;
}
