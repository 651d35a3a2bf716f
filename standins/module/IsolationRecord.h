#pragma once

namespace standins {

/// Under HKEY_LOCAL_MACHINE what this machine has to keep engines from all that is not theirs, for
/// the host to tell: "Means" and "Missing", texts as in Isolation.
constexpr const wchar_t* IsolationKey = L"SOFTWARE\\Orvanta\\Stand-Ins\\Isolation";

/// Enters it; for the registration of every stand-in.
void EnterIsolation();

} // namespace standins
