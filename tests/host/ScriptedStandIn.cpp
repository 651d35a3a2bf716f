// A stand-in for tests of the host: enters a Word, an Excel and their engine, and tells the clocks
// by way of the engine's name; and a Distiller with its bridge.

#include <objbase.h>
#include <windows.h>

#include <wx/string.h>
#include <wx/utils.h>
// After the strings, which it takes for granted.
#include <wx/msw/registry.h>

namespace {

const wxString OwnKey = "SOFTWARE\\Orvanta\\Office Stand-Ins";
const wxString IsolationKey = "SOFTWARE\\Orvanta\\Stand-Ins\\Isolation";
const wxString InstallationKey = "SOFTWARE\\Orvanta\\Marlo Quillon";
const wxString DistillerStandInKey = "SOFTWARE\\Orvanta\\Distiller Stand-In";
const wxString DistillerKey = "SOFTWARE\\Adobe\\Acrobat Distiller\\9.0";
const wxString ProgIds[] = {"Word.Application", "Excel.Application"};

void EnterText(wxRegKey::StdKey root, const wxString& keyName, const char* valueName,
               const wxString& text) {
    wxRegKey key(root, keyName);
    key.Create();
    key.SetValue(valueName, text);
}

/// @return 0 when there is none
long Number(const wxString& keyName, const char* value) {
    const wxRegKey key(wxRegKey::HKCU, keyName);
    long number = 0;
    if (key.Exists() && key.HasValue(value))
        key.QueryValue(value, &number);
    return number;
}

} // namespace

STDAPI DllRegisterServer() {
    for (const wxString& progId : ProgIds) {
        EnterText(wxRegKey::HKCR, progId, "", "Scripted");
        EnterText(wxRegKey::HKCR, progId + "\\CurVer", "", progId + ".16");
    }

    EnterText(wxRegKey::HKLM, OwnKey, "Engine",
              wxString::Format("Scripted engine, %ld of %ld s, %ld MB, output %ld of %ld s",
                               Number(OwnKey, "StallSeconds"), Number(OwnKey, "TotalSeconds"),
                               Number(OwnKey, "MemoryMegabytes"),
                               Number(InstallationKey, "OutputStallSeconds"),
                               Number(InstallationKey, "OutputTotalSeconds")));
    EnterText(wxRegKey::HKLM, IsolationKey, "Means", "Scripted walls");
    EnterText(wxRegKey::HKLM, IsolationKey, "Missing", wxString(wxGetenv("SCRIPTED_GAP")));
    EnterText(wxRegKey::HKLM, InstallationKey, "InstallPath", TEST_INSTALLATION);
    EnterText(wxRegKey::HKLM, DistillerStandInKey, "Engine", "Scripted Distiller");
    EnterText(wxRegKey::HKLM, DistillerKey, "JobOptionsFolder", TEST_PROFILES);
    return S_OK;
}

STDAPI DllUnregisterServer() {
    for (const wxString& progId : ProgIds)
        wxRegKey(wxRegKey::HKCR, progId).DeleteSelf();
    for (const wxString& key :
         {OwnKey, IsolationKey, InstallationKey, DistillerStandInKey, DistillerKey})
        wxRegKey(wxRegKey::HKLM, key).DeleteSelf();
    for (const wxString& key : {OwnKey, DistillerStandInKey})
        wxRegKey(wxRegKey::HKCU, key).DeleteSelf();
    return S_OK;
}
