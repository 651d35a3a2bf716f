#pragma once

#include <wx/string.h>

/// How a presentation is printed. The texts of `outputType` and `colour` are the settings panel's
/// entries as it showed them, in the language that the host had when they were saved.
struct PowerPointOptions {
    wxString outputType;    ///< "Slides", "Handouts", "Notes Pages" or "Outline View"
    wxString colour;        ///< "Color", "Grayscale" or "Pure Black and White"
    wxString slidesPerPage; ///< "1", "2", "3", "4", "6" or "9"
    wxString handoutOrder;  ///< "1" horizontal, "2" vertical, empty: as PowerPoint has it
    bool scaleToFit = false;
    bool printHiddenSlides = false;
    bool frameSlides = false;
    bool printCommentsAndInkMarkup = false;
    bool highQuality = false;
};
