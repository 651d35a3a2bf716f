#pragma once

#include "standins/shared/Clocks.h"

namespace standins {

/// Reads how long a document may take: the numbers "StallSeconds" and "TotalSeconds" of a registry
/// key below HKEY_CURRENT_USER or else HKEY_LOCAL_MACHINE.
/// @param standard for what is in neither
TimeLimits ReadTimeLimits(const wchar_t* key, const TimeLimits& standard);

/// Reads how much memory a document may take: the number "MemoryMegabytes" there, or else 3584.
/// @return bytes
std::uint64_t ReadMemoryLimit(const wchar_t* key);

} // namespace standins
