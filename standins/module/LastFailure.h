#pragma once

#include "standins/process/Failure.h"

namespace standins {

/// Under HKEY_CURRENT_USER the word of the last failure: "Reason", a text, and "Fault", which is
/// "document", "machine" or "outside". Applications and bridges answer their client with a code or
/// less; the host, which has no other way to learn the reason, finds it here, and takes the key
/// away before it has a filter do anything.
constexpr const wchar_t* LastFailureKey = L"SOFTWARE\\Orvanta\\Stand-Ins\\Last Failure";
constexpr const wchar_t* FailureReasonValue = L"Reason";
constexpr const wchar_t* FailureFaultValue = L"Fault";

/// Leaves word of a failure, in place of an earlier one.
void LeaveFailure(const Failure& failure);

} // namespace standins
