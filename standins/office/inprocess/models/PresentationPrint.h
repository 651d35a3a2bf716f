#pragma once

#include <string>
#include <vector>

namespace standins {

/// What is printed of a presentation, and how: PowerPoint's print options, with the values that
/// they have in a presentation that nobody has touched.
struct PresentationPrint {
    /// PpPrintOutputType
    enum Output : long {
        Slides = 1,
        TwoSlideHandouts = 2,
        ThreeSlideHandouts = 3,
        SixSlideHandouts = 4,
        NotesPages = 5,
        Outline = 6,
        FourSlideHandouts = 8,
        NineSlideHandouts = 9,
        OneSlideHandouts = 10,
    };
    /// PpPrintColorType
    enum Colour : long { Color = 1, BlackAndWhite = 2, PureBlackAndWhite = 3 };
    /// The order in which the slides fill a handout, as the settings of the filter count it.
    enum Order : long { AcrossFirst = 1, DownFirst = 2 };

    std::wstring printer;
    Output output = Slides;
    Colour colour = Color;
    Order order = AcrossFirst;
    bool fitToPage = false;
    bool hiddenSlides = true;
    bool frames = false;
    bool comments = true;
};

/// How a presentation is loaded to begin with: as its slides, without the hidden ones.
extern const char* const SlidesExport;
/// The same with the hidden ones, which may be asked for next.
extern const char* const HiddenSlidesExport;

/// As what the engine must make the presentation for this print, as in DocumentFormat.
std::string ExportFor(const PresentationPrint& print);

/// How the program that writes the PostScript has to lay that out.
std::vector<std::string> LayoutFor(const PresentationPrint& print);

} // namespace standins
