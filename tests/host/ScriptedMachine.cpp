// A stand-in for tests of the host: makes the registry what the environment says, in lines "delete
// KEY", "key KEY", "text KEY|VALUE|TEXT" and "flag KEY|VALUE". A key begins with HKCR, HKCU or
// HKLM.

#include <objbase.h>
#include <windows.h>

#include <wx/string.h>
// After the strings, which it takes for granted.
#include <wx/msw/registry.h>
#include <wx/tokenzr.h>
#include <wx/utils.h>

namespace {

wxRegKey::StdKey RootNamed(const wxString& name) {
    return name == "HKCR" ? wxRegKey::HKCR : name == "HKCU" ? wxRegKey::HKCU : wxRegKey::HKLM;
}

template <typename Action>
void ForEachLine(Action action) {
    wxString script;
    wxGetEnv("SCRIPTED_MACHINE", &script);
    for (const wxString& line : wxStringTokenize(script, "\n")) {
        const wxString value = line.AfterFirst('|');
        const wxString fullName = line.BeforeFirst('|').AfterFirst(' ');
        wxRegKey key(RootNamed(fullName.BeforeFirst('\\')), fullName.AfterFirst('\\'));
        action(line.BeforeFirst(' '), key, value.BeforeFirst('|'), value.AfterFirst('|'));
    }
}

} // namespace

STDAPI DllRegisterServer() {
    ForEachLine(
        [](const wxString& verb, wxRegKey& key, const wxString& name, const wxString& text) {
            if (verb == "delete")
                key.DeleteSelf();
            else
                key.Create();
            if (verb == "text")
                key.SetValue(name, text);
            if (verb == "flag")
                key.SetValue(name, 1L);
        });
    return S_OK;
}

STDAPI DllUnregisterServer() {
    ForEachLine(
        [](const wxString&, wxRegKey& key, const wxString&, const wxString&) { key.DeleteSelf(); });
    return S_OK;
}
