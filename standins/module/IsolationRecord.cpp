#include "standins/module/IsolationRecord.h"

#include "standins/module/RegistryKey.h"
#include "standins/module/Text.h"
#include "standins/process/Isolation.h"

namespace standins {

void EnterIsolation() {
    const Isolation isolation = LookAtIsolation();
    const RegistryKey key = RegistryKey::Create(HKEY_LOCAL_MACHINE, IsolationKey);
    key.SetText(L"Means", FromUtf8(isolation.means));
    key.SetText(L"Missing", FromUtf8(isolation.missing));
}

} // namespace standins
