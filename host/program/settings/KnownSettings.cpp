#include "host/program/settings/KnownSettings.h"

#include "common/WQServices.h"

#include <algorithm>

const Setting* FindSetting(const wxString& key) {
    const auto* const found =
        std::find_if(std::begin(FilterSettings::All), std::end(FilterSettings::All),
                     [&key](const Setting* setting) { return key == setting->key; });
    return found == std::end(FilterSettings::All) ? nullptr : *found;
}

const SettingChoice* FindChoice(const Setting& setting, const wxString& text) {
    const WQTranslations& catalogue = WQTranslations::GetInstance();
    const auto* const found = std::find_if(
        setting.choices.begin(), setting.choices.end(), [&](const SettingChoice& choice) {
            return catalogue.GetTranslations(choice.text).Index(text) != wxNOT_FOUND;
        });
    return found == setting.choices.end() ? nullptr : found;
}

std::vector<wxString> ValuesOf(const Setting& setting) {
    if (setting.kind == Setting::Flag)
        return {"0", "1"};
    std::vector<wxString> values;
    for (const SettingChoice& choice : setting.choices)
        values.emplace_back(choice.text);
    return values;
}

bool Takes(const Setting& setting, const wxString& text) {
    const std::vector<wxString> values = ValuesOf(setting);
    return values.empty() || std::find(values.begin(), values.end(), text) != values.end() ||
           FindChoice(setting, text);
}
