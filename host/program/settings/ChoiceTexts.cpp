#include "host/program/settings/ChoiceTexts.h"

#include "common/WQServices.h"
#include "host/program/settings/Settings.h"
#include "plugin/settings/FilterSettings.h"

#include <wx/translation.h>

void TranslateChoices(Settings& settings) {
    const WQTranslations& catalogue = WQTranslations::GetInstance();
    for (const Setting* const setting : FilterSettings::All) {
        if (setting->kind != Setting::Text)
            continue;
        const wxString value = settings.Value(setting->key);
        for (const SettingChoice& choice : setting->choices)
            if (catalogue.GetTranslations(choice.text).Index(value) != wxNOT_FOUND) {
                settings.Set(setting->key, wxGetTranslation(choice.text));
                break;
            }
    }
}
