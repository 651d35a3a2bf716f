#pragma once

#include <wx/string.h>

/// How a presentation is printed, as the settings say it. The texts of `outputType` and `colour`
/// are the settings panel's entries as it showed them, in the language that the host had when they
/// were saved.
struct PowerPointOptions {
    wxString outputType;
    wxString colour;
    wxString slidesPerPage;
    wxString handoutOrder; ///< "1" horizontal, "2" vertical, empty: as PowerPoint has it
    bool scaleToFit = false;
    bool printHiddenSlides = false;
    bool frameSlides = false;
    bool printCommentsAndInkMarkup = false;
    bool highQuality = false;
};
