#include "tests/support/bridge/BridgeScript.h"

#include "tests/support/RegistryText.h"

#include <wx/filename.h>
#include <wx/msw/registry.h>

#include <gtest/gtest.h>

namespace {

constexpr wchar_t InstallationKey[] = L"SOFTWARE\\Orvanta\\Marlo Quillon";

long Number(const char* name) {
    long value = 0;
    wxRegKey(wxRegKey::HKCU, BridgeScriptKey).QueryValue(name, &value);
    return value;
}

wxString Text(const char* name) {
    wxString value = "(nothing)";
    wxRegKey(wxRegKey::HKCU, BridgeScriptKey).QueryValue(name, value);
    return value;
}

void Enter(const char* name, long value) {
    wxRegKey key(wxRegKey::HKCU, BridgeScriptKey);
    EXPECT_TRUE(key.Create() && key.SetValue(name, value));
}

} // namespace

BridgeScript::BridgeScript(const wxString& installFolder) {
    const wxString filters = installFolder + wxFILE_SEP_PATH + "Filters";
    EXPECT_TRUE(wxFileName::Mkdir(filters, wxS_DIR_DEFAULT, wxPATH_MKDIR_FULL));
    EXPECT_TRUE(wxCopyFile(SCRIPTED_BRIDGE, filters + wxFILE_SEP_PATH + "orv_dist.dll"));
    WriteRegistryText(HKEY_LOCAL_MACHINE, InstallationKey, L"InstallPath",
                      installFolder.ToStdWstring());
    wxRegKey(wxRegKey::HKCU, BridgeScriptKey).DeleteSelf();
}

BridgeScript::~BridgeScript() {
    wxRegKey(wxRegKey::HKCU, BridgeScriptKey).DeleteSelf();
    RegDeleteTreeW(HKEY_LOCAL_MACHINE, InstallationKey);
}

void BridgeScript::Answer(long result) {
    Enter("Result", result);
}

void BridgeScript::Throw() {
    Enter("Throws", 1);
}

long BridgeScript::Calls() const {
    return Number("Calls");
}

wxString BridgeScript::PSPath() const {
    return Text("PSPath");
}

wxString BridgeScript::PDFPath() const {
    return Text("PDFPath");
}

wxString BridgeScript::Profile() const {
    return Text("Profile");
}

bool BridgeScript::WasCalledProperly() const {
    return Number("HasCom") == 1 && Number("HasReserved") == 0;
}
