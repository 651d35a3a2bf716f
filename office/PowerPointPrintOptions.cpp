#include "office/PowerPointPrintOptions.h"

#include "common/WQServices.h"
#include "plugin/settings/FilterSettings.h"

#include <algorithm>
#include <optional>

namespace {

bool IsTranslationOf(const wxString& text, const char* english) {
    return WQTranslations::GetInstance().GetTranslations(english).Index(text) != wxNOT_FOUND;
}

/// @return the number of the choice that the text is; of its translations where it has any
std::optional<LONG> NumberOf(const Setting& setting, const wxString& text) {
    const auto* const choice = std::find_if(
        setting.choices.begin(), setting.choices.end(), [&](const SettingChoice& each) {
            return setting.kind == Setting::Text ? IsTranslationOf(text, each.text)
                                                 : text == each.text;
        });
    return choice == setting.choices.end() ? std::nullopt : std::optional<LONG>(choice->number);
}

} // namespace

void PutColour(powerpoint::PrintOptions& target, const PowerPointOptions& options) {
    if (const auto type = NumberOf(FilterSettings::Colour, options.colour))
        target.PutPrintColorType(*type);
}

void PutContents(powerpoint::PrintOptions& target, const PowerPointOptions& options) {
    if (const auto type = NumberOf(FilterSettings::OutputType, options.outputType))
        target.PutOutputType(*type);
    if (IsTranslationOf(options.outputType, FilterSettings::Handouts))
        if (const auto type = NumberOf(FilterSettings::SlidesPerPage, options.slidesPerPage))
            target.PutOutputType(*type);
    if (options.handoutOrder == "1") // PpPrintHandoutOrder
        target.PutHandoutOrder(1);
    else if (options.handoutOrder == "2")
        target.PutHandoutOrder(2);
}

void PutSwitches(powerpoint::PrintOptions& target, const PowerPointOptions& options) {
    target.PutFitToPage(options.scaleToFit ? 1 : 0);
    target.PutPrintHiddenSlides(options.printHiddenSlides ? 1 : 0);
    target.PutFrameSlides(options.frameSlides ? 1 : 0);
    target.PutPrintComments(options.printCommentsAndInkMarkup ? 1 : 0);
}
