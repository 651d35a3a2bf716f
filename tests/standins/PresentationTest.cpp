#include "tests/standins/OfficeTest.h"
#include "tests/standins/Viewers.h"

#include <gmock/gmock.h>

#include <algorithm>

namespace fs = std::filesystem;
using testing::HasSubstr;
using testing::Not;

namespace {

using Texts = std::vector<std::string>;

constexpr int Slides = 8;
/// A word of each slide of the deck that is not hidden, in the order of the slides.
const Texts SlideWords = {"surprises", "comes",  "folder", "night",
                          "numbers",   "places", "helps",  "Questions?"};

class PresentationTest : public OfficeTest {
protected:
    /// Prints the deck.
    /// @return the PostScript file
    fs::path PrintDeck(const PowerPointOptions& options) {
        const fs::path deck = Sample("deck.pptx");
        EXPECT_EQ("", Print(deck, options));
        return PrintedFile(deck);
    }
};

/// The number of the slide whose word stands in each place of the sheets: sheet after sheet, and
/// in a sheet row after row. 0 where there is none.
std::vector<int> SlidesByPlace(const fs::path& pdf, int columns, int rows) {
    const int places = columns * rows;
    const int sheets = (Slides + places - 1) / places;
    std::vector<int> found(static_cast<std::size_t>(sheets) * static_cast<std::size_t>(places));
    for (const PlacedWord& word : PdfWords(pdf)) {
        const auto slide = std::find(SlideWords.begin(), SlideWords.end(), word.text);
        if (slide == SlideWords.end())
            continue;
        const int column = static_cast<int>(word.x / (595.0 / columns));
        const int row = static_cast<int>(word.y / (842.0 / rows));
        const int place = (word.page - 1) * places + row * columns + column;
        found.at(static_cast<std::size_t>(place)) =
            static_cast<int>(slide - SlideWords.begin()) + 1;
    }
    return found;
}

} // namespace

TEST_F(PresentationTest, HandoutsHaveTheirSlidesInEitherOrder) {
    const struct {
        const char* slidesPerPage;
        const char* order;
        int columns, rows;
        std::vector<int> slides;
    } cases[] = {
        {"2", "2", 1, 2, {1, 2, 3, 4, 5, 6, 7, 8}},
        {"3", "1", 1, 3, {1, 2, 3, 4, 5, 6, 7, 8, 0}},
        {"4", "2", 2, 2, {1, 3, 2, 4, 5, 7, 6, 8}},
        {"6", "1", 2, 3, {1, 2, 3, 4, 5, 6, 7, 8, 0, 0, 0, 0}},
        {"6", "2", 2, 3, {1, 4, 2, 5, 3, 6, 7, 0, 8, 0, 0, 0}},
        {"9", "1", 3, 3, {1, 2, 3, 4, 5, 6, 7, 8, 0}},
        {"9", "2", 3, 3, {1, 4, 7, 2, 5, 8, 3, 6, 0}},
    };
    for (const auto& [slidesPerPage, order, columns, rows, slides] : cases) {
        const fs::path pdf =
            DistilledByGhostscript(PrintDeck({"Handouts", "Color", slidesPerPage, order}));
        EXPECT_EQ(slides, SlidesByPlace(pdf, columns, rows)) << slidesPerPage << ", " << order;
        const std::size_t sheets = slides.size() / static_cast<std::size_t>(columns * rows);
        EXPECT_EQ(Texts(sheets, "595x842"), PdfPageSizes(pdf));
    }
}

TEST_F(PresentationTest, PrintsWhatTheOptionsAskFor) {
    constexpr auto Hidden = &PowerPointOptions::printHiddenSlides;
    constexpr auto Comments = &PowerPointOptions::printCommentsAndInkMarkup;
    Texts slidesAndComments(8, "960x540");
    slidesAndComments.emplace_back("595x842");
    const struct {
        const char* outputType;
        bool PowerPointOptions::*chosen; ///< null for none
        Texts sizes;
        Texts words;
        Texts otherWords = {};
    } cases[] = {
        {"Slides",
         nullptr,
         Texts(8, "960x540"),
         {"Größe", "Nobody"},
         {"Until", "Welcome", "Marlo"}},
        {"Slides", Hidden, Texts(9, "960x540"), {"Until last year"}},
        {"Slides", &PowerPointOptions::scaleToFit, Texts(8, "842x595"), {"Größe"}},
        {"Slides", Comments, slidesAndComments, {"Ada Quill, 2025-02-11", "Marlo?", "Łódź!"}},
        {"Notes Pages",
         nullptr,
         Texts(8, "540x780"),
         {"Welcome", "Questions?"},
         {"Show this only"}},
        {"Notes Pages", Hidden, Texts(9, "540x780"), {"Welcome everybody", "Show this only"}},
        {"Outline View",
         nullptr,
         {"595x842"},
         {"surprises", "For new colleagues", "mostly A4", "Пловдив", "Questions?"},
         {"Nobody", "Until", "Welcome", "Marlo"}},
        {"Outline View", Hidden, {"595x842"}, {"Until last year"}},
    };
    for (const auto& [outputType, chosen, sizes, words, otherWords] : cases) {
        PowerPointOptions options;
        options.outputType = outputType;
        if (chosen)
            options.*chosen = true;
        const fs::path output = PrintDeck(options);
        EXPECT_EQ(sizes, PdfPageSizes(DistilledByGhostscript(output))) << outputType;
        const std::string text = PostScriptText(output);
        for (const std::string& word : words)
            EXPECT_THAT(text, HasSubstr(word)) << outputType;
        for (const std::string& word : otherWords)
            EXPECT_THAT(text, Not(HasSubstr(word))) << outputType;
    }
}

TEST_F(PresentationTest, ColoursAreThoseThatAreAskedFor) {
    constexpr std::size_t Cyan = 0;
    constexpr std::size_t Black = 3;
    constexpr std::size_t FlowSlide = 2;
    constexpr std::size_t DarkSlide = 3;
    const auto inkWith = [&](const char* colour) {
        const fs::path output = PrintDeck({"Slides", colour, "", ""});
        EXPECT_THAT(PostScriptText(output), HasSubstr("At night")) << "it is no text any more";
        return InkOf(output);
    };
    EXPECT_GT(inkWith("Color").at(FlowSlide)[Cyan], 0.05);
    const NumbersOfPages gray = inkWith("Grayscale");
    const NumbersOfPages blackAndWhite = inkWith("Pure Black and White");
    for (const NumbersOfPages& pages : {gray, blackAndWhite}) {
        EXPECT_EQ(std::size_t{Slides}, pages.size());
        for (const auto& ink : pages)
            EXPECT_EQ(0, ink[0] + ink[1] + ink[2]);
    }
    EXPECT_GT(gray.at(FlowSlide)[Black], 0.1);
    EXPECT_GT(gray.at(DarkSlide)[Black], 0.9);
    EXPECT_LT(blackAndWhite.at(FlowSlide)[Black], 0.05); // white boxes
    EXPECT_LT(blackAndWhite.at(DarkSlide)[Black], 0.05); // black words on a white ground
    EXPECT_GT(blackAndWhite.at(DarkSlide)[Black], 0.001);
}

TEST_F(PresentationTest, FramesGoAroundTheSlides) {
    PowerPointOptions options{"Handouts", "Color", "2", "1"};
    options.frameSlides = true;
    // The last two slides do not reach their upper edges without.
    EXPECT_THAT(BoundsOf(PrintDeck(options)).at(3),
                testing::Pointwise(testing::DoubleNear(0.5), {44.5, 84.5, 550.5, 757.5}));
}
