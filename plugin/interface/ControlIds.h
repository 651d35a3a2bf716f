#pragma once

/// The identifiers of the settings panel's controls. The host's saved layouts and its help know
/// them: a number once given stays with its control.
namespace ControlId {

enum : int {
    OutputPS = 13000,
    OutputPDF = 13001,
    DistillerProfileLabel = 13004,
    DistillerProfile = 13005,

    InputTypesLabel = 17000,
    InputTypes = 17001,

    PrinterLabel = 19000,
    Printer = 19001,
    PrintLabel = 19002,
    Print = 19003,
    ColourLabel = 19004,
    Colour = 19005,
    HandoutsHeading = 19006,
    Separator = 19007, ///< of both headings
    SlidesPerPageLabel = 19008,
    SlidesPerPage = 19009,
    NoImage = 19010,
    OrderLabel = 19011,
    OrderHorizontal = 19012,
    OrderVertical = 19013,
    AdvancedHeading = 19014,
    ScaleToFitPaper = 19015,
    PrintHiddenSlides = 19016,
    FrameSlides = 19017,
    HighQuality = 19018,
    PrintCommentsAndInkMarkup = 19019,
    NotePanel = 19020,
};

} // namespace ControlId
