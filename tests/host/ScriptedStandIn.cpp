// A stand-in for tests of the host: enters a Word and its engine, and tells the engine's clocks by
// way of the engine's name; and a Distiller.

#include <objbase.h>
#include <windows.h>

#include <wx/string.h>
// After the strings, which it takes for granted.
#include <wx/msw/registry.h>

namespace {

const wxString OwnKey = "SOFTWARE\\Orvanta\\Office Stand-Ins";
const wxString DistillerStandInKey = "SOFTWARE\\Orvanta\\Distiller Stand-In";
const wxString DistillerKey = "SOFTWARE\\Adobe\\Acrobat Distiller\\9.0";

} // namespace

STDAPI DllRegisterServer() {
    wxRegKey(wxRegKey::HKCR, "Word.Application").Create();
    wxRegKey current(wxRegKey::HKCR, "Word.Application\\CurVer");
    current.Create();
    current.SetValue(wxEmptyString, wxString("Word.Application.16"));

    long stall = 0;
    long total = 0;
    const wxRegKey clocks(wxRegKey::HKCU, OwnKey);
    if (clocks.Exists()) {
        clocks.QueryValue("StallSeconds", &stall);
        clocks.QueryValue("TotalSeconds", &total);
    }
    wxRegKey self(wxRegKey::HKLM, OwnKey);
    self.Create();
    self.SetValue("Engine", wxString::Format("Scripted engine, %ld of %ld s", stall, total));

    wxRegKey distiller(wxRegKey::HKLM, DistillerStandInKey);
    distiller.Create();
    distiller.SetValue("Engine", wxString("Scripted Distiller"));
    wxRegKey version(wxRegKey::HKLM, DistillerKey);
    version.Create();
    version.SetValue("JobOptionsFolder", wxString(TEST_PROFILES));
    return S_OK;
}

STDAPI DllUnregisterServer() {
    wxRegKey(wxRegKey::HKCR, "Word.Application").DeleteSelf();
    for (const wxString& key : {OwnKey, DistillerStandInKey, DistillerKey})
        wxRegKey(wxRegKey::HKLM, key).DeleteSelf();
    wxRegKey(wxRegKey::HKCU, OwnKey).DeleteSelf();
    return S_OK;
}
