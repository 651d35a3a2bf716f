// What the filter asks of a bridge library.

#include "pstools/DistillerBridge.h"
#include "standins/distiller/bridge/Distill.h"
#include "standins/module/LastFailure.h"
#include "standins/module/Text.h"

#include <windows.h>

#include <glib.h>

#include <exception>
#include <memory>

namespace {

using standins::DistillOutcome;
using standins::DistillResult;

/// @return nothing when it is null or no UTF-16
std::optional<std::string> FromUtf16(const char16_t* text) {
    if (!text)
        return std::nullopt;
    const std::unique_ptr<char, decltype(&g_free)> utf8(
        g_utf16_to_utf8(reinterpret_cast<const gunichar2*>(text), -1, nullptr, nullptr, nullptr),
        g_free);
    return utf8 ? std::optional<std::string>(utf8.get()) : std::nullopt;
}

void Log(const std::string& record) {
    OutputDebugStringW(standins::FromUtf8(record).c_str());
}

DistillResult Convert(const DistillerRequest* record) {
    const auto postScript = FromUtf16(record ? record->psPath : nullptr);
    const auto pdf = FromUtf16(record ? record->pdfPath : nullptr);
    const auto profile = FromUtf16(record ? record->profile : nullptr);
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
