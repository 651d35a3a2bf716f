#pragma once

// How long filters wait for the file that an application prints into. Numbers below HostKey under
// HKEY_CURRENT_USER; without them the filter's own hold.

constexpr char OutputStallSecondsValue[] = "OutputStallSeconds"; ///< while it does not grow
constexpr char OutputTotalSecondsValue[] = "OutputTotalSeconds"; ///< altogether
