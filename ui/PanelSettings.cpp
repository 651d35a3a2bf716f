#include "ui/PanelSettings.h"

#include "common/Translated.h"

#include <wx/valgen.h>
#include <wx/window.h>

#include <algorithm>

namespace {

void Set(bool& flag, const wxString& text) {
    flag = text == "1";
}
void Set(wxString& member, const wxString& text) {
    member = text;
}

wxString TextOf(bool flag) {
    return flag ? "1" : "0";
}
wxString TextOf(const wxString& member) {
    return member;
}

} // namespace

void PanelValues::Bind(const wxWindow& panel) const {
    for (const PanelValue& value : m_values)
        std::visit([control = panel.FindWindow(value.control)](
                       auto* member) { control->SetValidator(wxGenericValidator(member)); },
                   value.member);
}

void PanelValues::Read(SettingsMap& settings) const {
    for (const auto& [control, setting, member] : m_values) {
        wxString text = settings[setting.key];
        if (text.empty() && *setting.panelStandard)
            text = Translated(setting.panelStandard);
        if (!text.empty())
            std::visit([&text](auto* target) { Set(*target, text); }, member);
    }
}

void PanelValues::Write(SettingsMap& settings) const {
    for (const auto& [control, setting, member] : m_values)
        settings[setting.key] = std::visit([](auto* value) { return TextOf(*value); }, member);
}

const PanelValue& PanelValues::Find(int control) const {
    return *std::find_if(m_values.begin(), m_values.end(),
                         [control](const PanelValue& value) { return value.control == control; });
}
