#include "standins/office/inprocess/models/PresentationPrint.h"

namespace standins {

namespace {

// Comments are always made part of the PDF, and seen when they are to be printed: so one PDF does
// for both.
#define IMPRESS_PDF                                                                                \
    "pdf:impress_pdf_Export:{\"ExportNotes\":{\"type\":\"boolean\",\"value\":\"true\"}"
#define HIDDEN_SLIDES ",\"ExportHiddenSlides\":{\"type\":\"boolean\",\"value\":\"true\"}"
constexpr const char* OnlyNotesPages =
    R"(,"ExportNotesPages":{"type":"boolean","value":"true"})"
    R"(,"ExportOnlyNotesPages":{"type":"boolean","value":"true"})";

/// @return 0 when it is no handout
int SlidesPerHandout(PresentationPrint::Output output) {
    switch (output) {
    case PresentationPrint::OneSlideHandouts:
        return 1;
    case PresentationPrint::TwoSlideHandouts:
        return 2;
    case PresentationPrint::ThreeSlideHandouts:
        return 3;
    case PresentationPrint::FourSlideHandouts:
        return 4;
    case PresentationPrint::SixSlideHandouts:
        return 6;
    case PresentationPrint::NineSlideHandouts:
        return 9;
    default:
        return 0;
    }
}

} // namespace

const char* const SlidesExport = IMPRESS_PDF "}";
const char* const HiddenSlidesExport = IMPRESS_PDF HIDDEN_SLIDES "}";

std::string ExportFor(const PresentationPrint& print) {
    if (print.output == PresentationPrint::Outline)
        return "odp:impress8";
    std::string pdf = IMPRESS_PDF;
    if (print.hiddenSlides)
        pdf += HIDDEN_SLIDES;
    if (print.output == PresentationPrint::NotesPages)
        pdf += OnlyNotesPages;
    return pdf + "}";
}

std::vector<std::string> LayoutFor(const PresentationPrint& print) {
    std::vector<std::string> layout;
    if (print.output == PresentationPrint::Outline)
        layout.emplace_back("--outline");
    if (const int slides = SlidesPerHandout(print.output))
        layout.push_back("--handout=" + std::to_string(slides));
    if (print.order == PresentationPrint::DownFirst)
        layout.emplace_back("--down-first");
    if (print.hiddenSlides)
        layout.emplace_back("--hidden");
    if (print.fitToPage)
        layout.emplace_back("--fit");
    if (print.frames && print.output != PresentationPrint::NotesPages) // those have frames anyway
        layout.emplace_back("--frames");
    if (print.comments)
        layout.emplace_back("--comments");
    if (print.colour != PresentationPrint::Color)
        layout.emplace_back(print.colour == PresentationPrint::BlackAndWhite ? "--colours=gray"
                                                                             : "--colours=black");
    return layout;
}

#undef HIDDEN_SLIDES
#undef IMPRESS_PDF

} // namespace standins
