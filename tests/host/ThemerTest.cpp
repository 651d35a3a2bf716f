#include "common/Themer.h"

#include "host/themer/Palette.h"

#include <gtest/gtest.h>

#include <cmath>

namespace {

/// The relative luminance of the Web Content Accessibility Guidelines.
double Luminance(unsigned rgb) {
    const auto linear = [](unsigned channel) {
        const double value = (channel & 0xFFU) / 255.0;
        return value <= 0.04045 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(rgb >> 16U) + 0.7152 * linear(rgb >> 8U) + 0.0722 * linear(rgb);
}

double Contrast(unsigned one, unsigned other) {
    const double a = Luminance(one);
    const double b = Luminance(other);
    return (std::max(a, b) + 0.05) / (std::min(a, b) + 0.05);
}

TEST(Themer, TextsCanBeReadOnLightAndDarkDesktops) {
    for (const Surface surface : {Surface::Default, Surface::Note, Surface::HeaderView})
        for (const bool dark : {false, true}) {
            const Palette& palette = PaletteOf(surface, dark);
            EXPECT_GE(Contrast(palette.background, palette.text), 7.0) << dark;
            EXPECT_NE(palette.background, palette.border);
            EXPECT_TRUE(!dark || Luminance(palette.background) < 0.1);
        }
}

TEST(Themer, GivesEachNameItsThemeAndUnknownNamesTheDefault) {
    const Themer& themer = *Themer::GetThemeService();
    const Theme& standard = themer.GetTheme("Default");
    const Theme& note = themer.GetTheme("Note");
    const Theme& header = themer.GetTheme("HeaderView");
    EXPECT_NE(standard.backgroundColour, note.backgroundColour);
    EXPECT_NE(standard.backgroundColour, header.backgroundColour);
    EXPECT_EQ(&themer.GetTheme("note"), &standard);
    EXPECT_EQ(&themer.GetTheme(nullptr), &standard);
    EXPECT_EQ(&themer.GetTheme("Note"), &note) << "a reference stays good";
    for (const Theme* theme : {&standard, &note, &header})
        EXPECT_TRUE(theme->font.IsOk() && theme->textColour.IsOk() && theme->borderColour.IsOk());
    EXPECT_EQ(header.font.GetWeight(), wxFONTWEIGHT_BOLD);
}

} // namespace
