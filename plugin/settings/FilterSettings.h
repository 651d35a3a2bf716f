#pragma once

#include <cstddef>
#include <cstdint>

// All that is said about the filter's settings: what its panel, its conversions and the host ask of
// one is in its row here. A new setting is a row, listed in All.

/// One of a setting's choices.
struct SettingChoice {
    const char* text;    ///< in English, its key in the host's catalogue
    std::int32_t number; ///< PowerPoint's
};

/// The choices of a setting, in the order in which they are offered.
class SettingChoices {
public:
    constexpr SettingChoices() = default;
    template <std::size_t Count>
    constexpr SettingChoices(const SettingChoice (&choices)[Count]) // NOLINT: an array is a list
        : m_begin(choices), m_end(choices + Count) {}

    constexpr const SettingChoice* begin() const { return m_begin; }
    constexpr const SettingChoice* end() const { return m_end; }

private:
    const SettingChoice* m_begin = nullptr;
    const SettingChoice* m_end = nullptr;
};

/// A setting, as it is stored below the element "UI".
struct Setting {
    enum Kind {
        Flag,    ///< "1" or "0"
        Text,    ///< one of the choices, as the panel shows it in the host's language
        Number,  ///< one of the choices, digits
        Printer, ///< a printer's name
        Profile, ///< the name of a Distiller profile
    };

    const char* key;
    Kind kind;
    const char* panelStandard; ///< what the panel starts from; empty: what the machine has first
    const char* standard;      ///< what holds for a conversion; empty: it depends
    const char* meaning;       ///< for people; null: its choices say it
    SettingChoices choices = {};
};

namespace FilterSettings {

/// The choice that brings the settings of handouts to life.
inline constexpr char Handouts[] = "Handouts";

// PpPrintOutputType, for slides per page, too: one slide a page is printed as a full slide, not as
// a handout of one.
inline constexpr SettingChoice OutputTypes[] = {
    {"Slides", 1}, {Handouts, 2}, {"Notes Pages", 5}, {"Outline View", 6}};
inline constexpr SettingChoice HandoutTypes[] = {{"1", 1}, {"2", 2}, {"3", 3},
                                                 {"4", 8}, {"6", 4}, {"9", 9}};

// PpPrintColorType
inline constexpr SettingChoice ColourTypes[] = {
    {"Color", 1}, {"Grayscale", 2}, {"Pure Black and White", 3}};

// clang-format off
inline constexpr Setting Printer{
    "PRINTER", Setting::Printer, "", "", "the printer to print on, as `quillon status` lists it"};
inline constexpr Setting OutputPS{
    "OUTPUTFILETYPEPS", Setting::Flag, "1", "0", "1: PostScript files only; 0: PDF files too"};
inline constexpr Setting OutputPDF{
    "OUTPUTFILETYPEPDF", Setting::Flag, "0", "", "the opposite; counts where that is not set"};
inline constexpr Setting DistillerProfile{
    "SELECTEDDISTILLERPROFILE", Setting::Profile, "", "",
    "the Distiller profile, as `quillon status` lists it"};
inline constexpr Setting OutputType{
    "PRINTOUTPUTTYPE", Setting::Text, "Slides", "Slides", nullptr, OutputTypes};
inline constexpr Setting Colour{
    "COLOR", Setting::Text, "Color", "Color", nullptr, ColourTypes};
inline constexpr Setting SlidesPerPage{
    "SLIDESPERPAGE", Setting::Number, "6", "6", "slides on a page of handouts", HandoutTypes};
inline constexpr Setting HandoutsHorizontal{
    "HANDOUTSHORIZONTAL", Setting::Flag, "1", "1", "1: slides of a handout run across the page"};
inline constexpr Setting HandoutsVertical{
    "HANDOUTSVERTICAL", Setting::Flag, "0", "0", "1: slides of a handout run down the page"};
inline constexpr Setting ScaleToFitPage{
    "SCALETOFITPAGE", Setting::Flag, "0", "0", "1: slides are scaled to fit the page"};
inline constexpr Setting FrameSlides{
    "FRAMESLIDES", Setting::Flag, "0", "0", "1: slides have a frame"};
inline constexpr Setting PrintHiddenSlides{
    "PRINTHIDDENSLIDES", Setting::Flag, "1", "0", "1: hidden slides are printed"};
inline constexpr Setting PrintCommentsAndInkMarkup{
    "PRINTCOMMENTSANDINKMARKUP", Setting::Flag, "1", "0", "1: comments and ink are printed"};
inline constexpr Setting HighQuality{
    "HIGHQUALITY", Setting::Flag, "0", "0", "1: slides are printed in high quality"};

/// Every setting, in the order in which people read them.
inline constexpr const Setting* All[] = {
    &Printer, &OutputPS, &OutputPDF, &DistillerProfile,
    &OutputType, &Colour, &SlidesPerPage, &HandoutsHorizontal, &HandoutsVertical,
    &ScaleToFitPage, &FrameSlides, &PrintHiddenSlides, &PrintCommentsAndInkMarkup, &HighQuality};
// clang-format on

} // namespace FilterSettings
