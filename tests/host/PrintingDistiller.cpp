// A stand-in for tests of the host: has the filter find a bridge that makes files, where it looks
// for the bridge of an installation.

#include "tests/support/bridge/BridgeScript.h"

#include <objbase.h>
#include <windows.h>

#include <wx/string.h>
// After the strings, which it takes for granted.
#include <wx/msw/registry.h>

namespace {

constexpr char InstallationKey[] = "SOFTWARE\\Orvanta\\Marlo Quillon";
constexpr char DistillerKey[] = "SOFTWARE\\Adobe\\Acrobat Distiller\\9.0";

} // namespace

STDAPI DllRegisterServer() {
    wxRegKey installation(wxRegKey::HKLM, InstallationKey);
    installation.Create();
    installation.SetValue("InstallPath", wxString(TEST_INSTALLATION));
    wxRegKey distiller(wxRegKey::HKLM, DistillerKey);
    distiller.Create();
    distiller.SetValue("JobOptionsFolder", wxString(TEST_PROFILES));
    wxRegKey script(wxRegKey::HKCU, BridgeScriptKey);
    script.Create();
    script.SetValue(MakesPdfValue, 1L);
    return S_OK;
}

STDAPI DllUnregisterServer() {
    for (const char* key : {InstallationKey, DistillerKey})
        wxRegKey(wxRegKey::HKLM, key).DeleteSelf();
    wxRegKey(wxRegKey::HKCU, BridgeScriptKey).DeleteSelf();
    return S_OK;
}
