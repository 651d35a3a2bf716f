#pragma once

#include "standins/shared/Failure.h"

#include <string>

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

/// Under HKEY_CURRENT_USER the fonts that others stood in for in the documents opened last: in the
/// value "Fonts", for each a line with the font asked for, the one used, and "metric" when it runs
/// alike, with tabs between. Applications answer their client nothing of the kind; the host finds
/// it here, and takes the key away before it has a filter do anything.
constexpr const wchar_t* LastFontsKey = L"SOFTWARE\\Orvanta\\Stand-Ins\\Last Fonts";
constexpr const wchar_t* FontsValue = L"Fonts";

/// Adds fonts to those that are left there. Those are left out that are installed, under another
/// name.
/// @param standIns for each a line with the font asked for, a tab and the one used; UTF-8
void LeaveFonts(const std::string& standIns);

/// Under HKEY_LOCAL_MACHINE what this machine has to keep engines from all that is not theirs, for
/// the host to tell: "Means" and "Missing", texts as in Isolation.
constexpr const wchar_t* IsolationKey = L"SOFTWARE\\Orvanta\\Stand-Ins\\Isolation";

/// Enters it; for the registration of every stand-in.
void EnterIsolation();

} // namespace standins
