#include "host/program/settings/ChoiceTexts.h"

#include "common/WQServices.h"
#include "host/program/settings/Settings.h"

#include <wx/translation.h>

#include <initializer_list>

namespace {

struct TextSetting {
    const char* key;
    std::initializer_list<const char*> choices; ///< in English
};

constexpr std::initializer_list<const char*> OutputTypes = {"Slides", "Handouts", "Notes Pages",
                                                            "Outline View"};
constexpr std::initializer_list<const char*> Colours = {"Color", "Grayscale",
                                                        "Pure Black and White"};

constexpr TextSetting TextSettings[] = {{"PRINTOUTPUTTYPE", OutputTypes}, {"COLOR", Colours}};

} // namespace

void TranslateChoices(Settings& settings) {
    const WQTranslations& catalogue = WQTranslations::GetInstance();
    for (const TextSetting& setting : TextSettings)
        for (const char* const choice : setting.choices)
            if (catalogue.GetTranslations(choice).Index(settings.Value(setting.key)) !=
                wxNOT_FOUND) {
                settings.Set(setting.key, wxGetTranslation(choice));
                break;
            }
}
