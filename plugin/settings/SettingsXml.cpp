#include "plugin/settings/SettingsXml.h"

#include "core/xml/XmlHelper.h"

#include <wx/xml/xml.h>

#include <memory>

namespace {

constexpr char SettingsElement[] = "UI";

} // namespace

void ReadSettingsXml(const wxXmlNode* node, SettingsMap& settings) {
    const wxXmlNode* element = node ? FindNode(node, SettingsElement) : nullptr;
    if (!element)
        return;
    for (const wxXmlNode* setting = element->GetChildren(); setting; setting = setting->GetNext())
        for (const wxXmlNode* part = setting->GetChildren(); part; part = part->GetNext())
            settings[setting->GetName()] = part->GetContent();
}

void AppendSettingsXml(wxXmlNode* parent, const SettingsMap& settings) {
    // The tree owns its nodes; until it is whole, this pointer does.
    auto element = std::make_unique<wxXmlNode>(wxXML_ELEMENT_NODE, SettingsElement);
    wxXmlNode* last = nullptr;
    for (const auto& [key, value] : settings) {
        auto setting = std::make_unique<wxXmlNode>(wxXML_ELEMENT_NODE, key);
        setting->AddChild(std::make_unique<wxXmlNode>(wxXML_TEXT_NODE, "text", value).release());
        element->InsertChildAfter(setting.get(), last); // AddChild would walk to the end each time
        last = setting.release();
    }
    parent->AddChild(element.release());
}
