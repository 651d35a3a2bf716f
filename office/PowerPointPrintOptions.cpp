#include "office/PowerPointPrintOptions.h"

#include "common/WQServices.h"

#include <optional>

namespace {

struct TextValue {
    const char* text;
    LONG value;
};

// PpPrintColorType
const TextValue ColourTypes[] = {{"Color", 1}, {"Grayscale", 2}, {"Pure Black and White", 3}};

// PpPrintOutputType
const TextValue OutputTypes[] = {
    {"Slides", 1}, {"Handouts", 2}, {"Notes Pages", 5}, {"Outline View", 6}};

// PpPrintOutputType too: one slide a page is printed as a full slide, not as a handout of one.
const TextValue HandoutTypes[] = {{"1", 1}, {"2", 2}, {"3", 3}, {"4", 8}, {"6", 4}, {"9", 9}};

// PpPrintHandoutOrder, as the settings have it: 1 for the horizontal order, 2 for the vertical one
const TextValue HandoutOrders[] = {{"1", 1}, {"2", 2}};

bool IsTranslationOf(const wxString& text, const char* english) {
    return WQTranslations::GetInstance().GetTranslations(english).Index(text) != wxNOT_FOUND;
}

template <std::size_t Count>
std::optional<LONG> ByTranslation(const TextValue (&values)[Count], const wxString& text) {
    for (const TextValue& value : values)
        if (IsTranslationOf(text, value.text))
            return value.value;
    return std::nullopt;
}

template <std::size_t Count>
std::optional<LONG> ByText(const TextValue (&values)[Count], const wxString& text) {
    for (const TextValue& value : values)
        if (text == value.text)
            return value.value;
    return std::nullopt;
}

} // namespace

void PutColour(powerpoint::PrintOptions& target, const PowerPointOptions& options) {
    if (const auto type = ByTranslation(ColourTypes, options.colour))
        target.PutPrintColorType(*type);
}

void PutContents(powerpoint::PrintOptions& target, const PowerPointOptions& options) {
    if (const auto type = ByTranslation(OutputTypes, options.outputType))
        target.PutOutputType(*type);
    if (IsTranslationOf(options.outputType, "Handouts"))
        if (const auto type = ByText(HandoutTypes, options.slidesPerPage))
            target.PutOutputType(*type);
    if (const auto order = ByText(HandoutOrders, options.handoutOrder))
        target.PutHandoutOrder(*order);
}

void PutSwitches(powerpoint::PrintOptions& target, const PowerPointOptions& options) {
    target.PutFitToPage(options.scaleToFit ? 1 : 0);
    target.PutPrintHiddenSlides(options.printHiddenSlides ? 1 : 0);
    target.PutFrameSlides(options.frameSlides ? 1 : 0);
    target.PutPrintComments(options.printCommentsAndInkMarkup ? 1 : 0);
}
