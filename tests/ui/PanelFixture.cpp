#include "tests/ui/PanelFixture.h"

#include "plugin/settings/SettingsXml.h"

#include <wx/app.h>
#include <wx/checkbox.h>
#include <wx/radiobut.h>
#include <wx/sizer.h>
#include <wx/xml/xml.h>

void PanelFixture::CloseHost() {
    if (m_host)
        m_host->Destroy();
    m_host = nullptr;
    wxTheApp->ProcessIdle(); // deletes what was destroyed
}

void PanelFixture::BuildPanel(const Settings& settings) {
    CloseHost();
    m_plugin.emplace();
    Install(m_machine);
    SettingsMap stored;
    for (const auto& [key, value] : settings)
        stored[key] = wxString::FromUTF8(value);
    wxXmlNode document(wxXML_ELEMENT_NODE, "settings");
    AppendSettingsXml(&document, stored);
    m_plugin->Initialize(wxString("<s><ServerVersion>") + m_serverVersion + "</ServerVersion></s>");
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
    SettingsMap saved;
    ReadSettingsXml(&document, saved);
    Settings settings;
    for (const auto& [key, value] : saved)
        settings[key.utf8_string()] = value.utf8_string();
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

bool PanelFixture::AreEnabled(std::initializer_list<int> ids, bool enabled) const {
    bool all = true;
    for (const int id : ids)
        all = all && Find(id)->IsThisEnabled() == enabled;
    return all;
}

void PanelFixture::Tick(int id, bool ticked) {
    dynamic_cast<wxCheckBox*>(Find(id))->SetValue(ticked);
    Tell(wxEVT_CHECKBOX, id, ticked ? 1 : 0);
}

void PanelFixture::Press(int id) {
    dynamic_cast<wxRadioButton*>(Find(id))->SetValue(true);
    Tell(wxEVT_RADIOBUTTON, id, 1);
}
