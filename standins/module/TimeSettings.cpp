#include "standins/module/TimeSettings.h"

#include "standins/module/RegistryKey.h"

#include <algorithm>

namespace standins {

namespace {

std::chrono::seconds ReadSeconds(const wchar_t* key, const wchar_t* name,
                                 std::chrono::seconds standard) {
    constexpr DWORD Most = 7 * 24 * 60 * 60; // a week; longer would overflow the clocks some day
    for (HKEY root : {HKEY_CURRENT_USER, HKEY_LOCAL_MACHINE}) {
        if (const auto number = RegistryKey::Open(root, key).Number(name))
            return std::chrono::seconds(std::clamp<DWORD>(*number, 1, Most));
    }
    return standard;
}

} // namespace

TimeLimits ReadTimeLimits(const wchar_t* key, const TimeLimits& standard) {
    return {ReadSeconds(key, L"StallSeconds", standard.stall),
            ReadSeconds(key, L"TotalSeconds", standard.total)};
}

} // namespace standins
