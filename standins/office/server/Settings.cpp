#include "standins/office/server/Settings.h"

#include "standins/module/RegistryKey.h"
#include "standins/module/Text.h"

#include <algorithm>

namespace standins {

namespace {

std::chrono::seconds ReadSeconds(const wchar_t* name, DWORD standard) {
    constexpr DWORD Most = 7 * 24 * 60 * 60; // a week; longer would overflow the clocks some day
    for (HKEY root : {HKEY_CURRENT_USER, HKEY_LOCAL_MACHINE}) {
        if (const auto number = RegistryKey::Open(root, SettingsKey).Number(name))
            return std::chrono::seconds(std::clamp<DWORD>(*number, 1, Most));
    }
    return std::chrono::seconds(standard);
}

} // namespace

TimeLimits ReadTimeLimits() {
    return {ReadSeconds(L"StallSeconds", 60), ReadSeconds(L"TotalSeconds", 600)};
}

std::string ReadEnginePath() {
    const RegistryKey key = RegistryKey::Open(HKEY_LOCAL_MACHINE, SettingsKey);
    return ToUtf8(key.Text(EnginePathValue).value_or(std::wstring())).value_or(std::string());
}

} // namespace standins
