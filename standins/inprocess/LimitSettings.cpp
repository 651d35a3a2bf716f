#include "standins/inprocess/LimitSettings.h"

#include "standins/inprocess/RegistryKey.h"

#include <algorithm>

namespace standins {

namespace {

/// @return the number, within its bounds
DWORD ReadNumber(const wchar_t* key, const wchar_t* name, DWORD least, DWORD most, DWORD standard) {
    for (HKEY root : {HKEY_CURRENT_USER, HKEY_LOCAL_MACHINE}) {
        if (const auto number = RegistryKey::Open(root, key).Number(name))
            return std::clamp(*number, least, most);
    }
    return standard;
}

std::chrono::seconds ReadSeconds(const wchar_t* key, const wchar_t* name,
                                 std::chrono::seconds standard) {
    constexpr DWORD Most = 7 * 24 * 60 * 60; // a week; longer would overflow the clocks some day
    return std::chrono::seconds(
        ReadNumber(key, name, 1, Most, static_cast<DWORD>(standard.count())));
}

} // namespace

TimeLimits ReadTimeLimits(const wchar_t* key, const TimeLimits& standard) {
    return {ReadSeconds(key, L"StallSeconds", standard.stall),
            ReadSeconds(key, L"TotalSeconds", standard.total)};
}

std::uint64_t ReadMemoryLimit(const wchar_t* key) {
    constexpr DWORD Standard = 3584;
    constexpr DWORD Most = DWORD{1} << 30;
    return std::uint64_t{ReadNumber(key, L"MemoryMegabytes", 1, Most, Standard)} << 20;
}

} // namespace standins
