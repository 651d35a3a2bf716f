#pragma once

#include <string>

namespace standins {

/// What stands on the sheets.
enum class Contents {
    Pages,    ///< one page of the PDF a sheet
    Handouts, ///< several, smaller
    Outline,  ///< the titles and texts of a presentation, which is then an OpenDocument file
};

enum class Colours { All, Gray, BlackAndWhite };

/// How a document is printed.
struct PrintJob {
    std::string title; ///< UTF-8; any characters
    std::string user;  ///< UTF-8
    int copies = 1;
    bool collate = true; ///< whole copies one after the other, not each sheet `copies` times

    Contents contents = Contents::Pages;
    int slidesPerSheet = 1;   ///< of handouts: 1, 2, 3, 4, 6 or 9
    bool downFirst = false;   ///< handouts are filled column by column, not row by row
    bool fitToPaper = false;  ///< pages are scaled to the paper, and not the paper to the pages
    bool frames = false;      ///< around each page
    bool comments = false;    ///< marked in the pages, and on sheets of their own at the end
    bool printHidden = false; ///< hidden slides in the outline
    Colours colours = Colours::All;
};

} // namespace standins
