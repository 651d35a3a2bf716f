// What the filter asks of a bridge library.

#include "pstools/DistillerBridge.h"
#include "standins/distiller/inprocess/Distill.h"
#include "standins/inprocess/HostRecord.h"
#include "standins/shared/Text.h"

#include <windows.h>

#include <exception>

namespace {

using standins::DistillOutcome;
using standins::DistillResult;

/// @return nothing when it is null or no UTF-16
std::optional<std::string> TextOf(const char16_t* text) {
    return text ? standins::FromUtf16(text) : std::nullopt;
}

void Log(const std::string& record) {
    OutputDebugStringW(standins::FromUtf8(record).c_str());
}

DistillResult Convert(const DistillerRequest* record) {
    const auto postScript = TextOf(record ? record->psPath : nullptr);
    const auto pdf = TextOf(record ? record->pdfPath : nullptr);
    const auto profile = TextOf(record ? record->profile : nullptr);
    if (!postScript || !pdf || !profile || pdf->empty()) {
        Log("A conversion to PDF was asked for without the names that it needs.");
        return DistillResult::BadRequest;
    }
    const DistillOutcome outcome = standins::Distill({*postScript, *pdf, *profile});
    if (outcome.result != DistillResult::Done) {
        Log(*postScript + " cannot be converted to " + *pdf + ": " + outcome.failure.reason + ".");
        standins::LeaveFailure(outcome.failure);
    }
    return outcome.result;
}

} // namespace

extern "C" std::int32_t DIST_convertFile(const DistillerRequest* request) {
    try {
        return static_cast<std::int32_t>(Convert(request));
    } catch (const std::exception&) {
        return static_cast<std::int32_t>(DistillResult::UnexpectedFault);
    }
}
