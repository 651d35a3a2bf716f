#pragma once

#include <string>
#include <vector>

namespace standins {

/// What stands on the sheets.
enum class Contents {
    Pages,    ///< one page of the PDF a sheet
    Handouts, ///< several, smaller
    Outline,  ///< the titles and texts of a presentation, which is then an OpenDocument file
};

enum class Colours { All, Gray, BlackAndWhite };

/// Paper that the printer has, upright, and how much of its edges stays white, in points.
struct PrinterPaper {
    double width = 0;
    double height = 0;
    double left = 0;
    double bottom = 0;
    double right = 0;
    double top = 0;
};

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
    std::vector<PrinterPaper> papers; ///< the usual one first; none when that is not known
    bool onlyThesePapers = false;     ///< not any other size too
};

} // namespace standins
