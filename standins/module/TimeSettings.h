#pragma once

#include "standins/process/Clocks.h"

namespace standins {

/// Reads how long a document may take: the numbers "StallSeconds" and "TotalSeconds" of a registry
/// key below HKEY_CURRENT_USER or else HKEY_LOCAL_MACHINE.
/// @param standard for what is in neither
TimeLimits ReadTimeLimits(const wchar_t* key, const TimeLimits& standard);

} // namespace standins
