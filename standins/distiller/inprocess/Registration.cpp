// Enters what a machine with Acrobat Distiller has in its registry, when Ghostscript is there to
// stand in for it.

#include "standins/distiller/inprocess/Ghostscript.h"
#include "standins/distiller/inprocess/Settings.h"
#include "standins/inprocess/HostRecord.h"
#include "standins/inprocess/Paths.h"
#include "standins/inprocess/RegistryKey.h"
#include "standins/shared/Text.h"
#include "standins/shared/WorkFolder.h"

#include <objbase.h>
#include <windows.h>

#include <exception>

namespace standins {

namespace {

constexpr const wchar_t* DistillerKey = L"SOFTWARE\\Adobe\\Acrobat Distiller\\9.0";
constexpr const wchar_t* JobOptionsValue = L"JobOptionsFolder";

std::wstring OurJobOptions() {
    return FromUtf8(HelperPath("../JobOptions"));
}

HRESULT Unregister() {
    if (RegistryKey::Open(HKEY_LOCAL_MACHINE, DistillerKey).Text(JobOptionsValue) ==
        OurJobOptions())
        RegDeleteTreeW(HKEY_LOCAL_MACHINE, DistillerKey);
    if (RegistryKey::Open(HKEY_LOCAL_MACHINE, DistillerSettingsKey).IsOpen())
        RegistryKey::Create(HKEY_LOCAL_MACHINE, DistillerSettingsKey).Delete(DistillerEngineValue);
    return S_OK;
}

HRESULT Register() {
    WorkFolder::DiscardAbandoned(DistillerFolderKind, nullptr); // a client starts
    Unregister();
    EnterIsolation();
    const std::optional<Ghostscript> ghostscript = FindGhostscript();
    if (!ghostscript)
        return S_OK;
    const bool isEntered = RegistryKey::Create(HKEY_LOCAL_MACHINE, DistillerKey)
                               .SetText(JobOptionsValue, OurJobOptions()) &&
                           RegistryKey::Create(HKEY_LOCAL_MACHINE, DistillerSettingsKey)
                               .SetText(DistillerEngineValue, FromUtf8(ghostscript->name));
    return isEntered ? S_OK : SELFREG_E_CLASS;
}

/// No exception leaves the module.
HRESULT Guarded(HRESULT (*work)()) {
    try {
        return work();
    } catch (const std::exception&) {
        return E_UNEXPECTED;
    }
}

} // namespace

} // namespace standins

STDAPI DllRegisterServer() {
    return standins::Guarded(standins::Register);
}

STDAPI DllUnregisterServer() {
    return standins::Guarded(standins::Unregister);
}
