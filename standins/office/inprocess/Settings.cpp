#include "standins/office/inprocess/Settings.h"

#include "standins/inprocess/LimitSettings.h"
#include "standins/inprocess/RegistryKey.h"
#include "standins/shared/Text.h"

using namespace std::chrono_literals;

namespace standins {

TimeLimits ReadTimeLimits() {
    return ReadTimeLimits(SettingsKey, {60s, 600s});
}

std::uint64_t ReadMemoryLimit() {
    return ReadMemoryLimit(SettingsKey);
}

bool ReadExamine() {
    return RegistryKey::Open(HKEY_CURRENT_USER, SettingsKey).Number(L"Examine").value_or(0) != 0;
}

unsigned ReadDocumentsPerStart() {
    return RegistryKey::Open(HKEY_CURRENT_USER, SettingsKey)
        .Number(L"DocumentsPerStart")
        .value_or(1);
}

std::string ReadEnginePath() {
    const RegistryKey key = RegistryKey::Open(HKEY_LOCAL_MACHINE, SettingsKey);
    return ToUtf8(key.Text(EnginePathValue).value_or(std::wstring())).value_or(std::string());
}

} // namespace standins
