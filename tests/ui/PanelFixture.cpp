#include "tests/ui/PanelFixture.h"

#include "tests/support/RegistryText.h"

#include <wx/app.h>
#include <wx/checkbox.h>
#include <wx/radiobut.h>
#include <wx/sizer.h>
#include <wx/xml/xml.h>

namespace {

constexpr wchar_t DistillerKey[] = L"SOFTWARE\\Adobe\\Acrobat Distiller\\9.0";

} // namespace

PanelFixture::PanelFixture() {
    RegDeleteTreeW(HKEY_LOCAL_MACHINE, DistillerKey);
}

PanelFixture::~PanelFixture() {
    CloseHost();
    RegDeleteTreeW(HKEY_LOCAL_MACHINE, DistillerKey);
}

void PanelFixture::CloseHost() {
    if (m_host)
        m_host->Destroy();
    m_host = nullptr;
    wxTheApp->ProcessIdle(); // deletes what was destroyed
}

void PanelFixture::BuildPanel(const Settings& settings) {
    CloseHost();
    m_plugin.emplace();
    m_office.emplace(m_machine.applications, m_machine.officeVersion);
    m_testPrinters.clear();
    const std::wstring ppd = m_folder.Write("a.ppd", "x").wstring();
    for (const std::wstring& printer : m_machine.printers)
        m_testPrinters.push_back(std::make_unique<TestPrinter>(printer, L"Test driver", ppd));
    std::filesystem::create_directories(m_folder / "profiles");
    for (const char* profile : m_machine.profiles)
        m_folder.Write(std::filesystem::path("profiles") / profile, "x");
    WriteRegistryText(HKEY_LOCAL_MACHINE, DistillerKey, L"JobOptionsFolder",
                      (m_folder / "profiles").wstring());

    wxXmlNode document(wxXML_ELEMENT_NODE, "settings");
    auto* element = new wxXmlNode(&document, wxXML_ELEMENT_NODE, "UI");
    for (const auto& [key, value] : settings)
        new wxXmlNode(new wxXmlNode(element, wxXML_ELEMENT_NODE, key), wxXML_TEXT_NODE, "text",
                      wxString::FromUTF8(value));
    m_plugin->Initialize(wxString("<s><ServerVersion>") + m_machine.serverVersion +
                         "</ServerVersion></s>");
    m_plugin->LoadSettings(&document);

    m_host = new wxFrame(nullptr, wxID_ANY, "Host");
    m_panel = m_plugin->CreateSettingsPanel(m_host);
    ASSERT_TRUE(m_panel);
    auto* sizer = new wxBoxSizer(wxVERTICAL);
    sizer->Add(m_panel, 1, wxEXPAND);
    m_host->SetSizerAndFit(sizer);
}

Settings PanelFixture::Saved() {
    wxXmlNode document(wxXML_ELEMENT_NODE, "settings");
    m_plugin->SaveSettings(&document);
    Settings settings;
    for (const wxXmlNode* setting = document.GetChildren()->GetChildren(); setting;
         setting = setting->GetNext())
        settings[setting->GetName().utf8_string()] = setting->GetNodeContent().utf8_string();
    return settings;
}

Settings PanelFixture::Shown() const {
    Settings settings;
    for (const auto& [id, setting] : SettingControls)
        settings[setting.key] = setting.kind != Setting::Flag ? Selection(id)
                                : IsTicked(id)                ? "1"
                                                              : "0";
    return settings;
}

wxWindow* PanelFixture::Find(int id) const {
    wxWindow* window = m_panel->FindWindow(id);
    EXPECT_TRUE(window) << id;
    return window;
}

wxChoice* PanelFixture::Choice(int id) const {
    return dynamic_cast<wxChoice*>(Find(id));
}

bool PanelFixture::IsTicked(int id) const {
    if (const auto* box = dynamic_cast<const wxCheckBox*>(Find(id)))
        return box->GetValue();
    return dynamic_cast<wxRadioButton*>(Find(id))->GetValue();
}

std::string PanelFixture::Selection(int id) const {
    return Choice(id)->GetStringSelection().utf8_string();
}

bool PanelFixture::AreEnabled(std::initializer_list<int> ids, bool enabled) const {
    bool all = true;
    for (const int id : ids)
        all = all && Find(id)->IsThisEnabled() == enabled;
    return all;
}

void PanelFixture::Choose(int id, const char* entry) {
    ASSERT_TRUE(Choice(id)->SetStringSelection(wxString::FromUTF8(entry))) << entry;
    Tell(wxEVT_CHOICE, id, Choice(id)->GetSelection());
}

void PanelFixture::Tick(int id, bool ticked) {
    dynamic_cast<wxCheckBox*>(Find(id))->SetValue(ticked);
    Tell(wxEVT_CHECKBOX, id, ticked ? 1 : 0);
}

void PanelFixture::Press(int id) {
    dynamic_cast<wxRadioButton*>(Find(id))->SetValue(true);
    Tell(wxEVT_RADIOBUTTON, id, 1);
}

void PanelFixture::Tell(wxEventType type, int id, int value) {
    wxCommandEvent event(type, id);
    event.SetEventObject(Find(id));
    event.SetInt(value);
    Find(id)->ProcessWindowEvent(event);
}
