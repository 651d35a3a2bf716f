#include "host/program/settings/ChoiceTexts.h"

#include "host/program/settings/KnownSettings.h"
#include "host/program/settings/Settings.h"

#include <wx/translation.h>

void TranslateChoices(Settings& settings) {
    for (const Setting* const setting : FilterSettings::All)
        if (setting->kind == Setting::Text)
            if (const SettingChoice* const choice =
                    FindChoice(*setting, settings.Value(setting->key)))
                settings.Set(setting->key, wxGetTranslation(choice->text));
}
