#include "tests/standins/OfficePrints.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/PostScriptText.h"

#include <gmock/gmock.h>

#include <algorithm>

namespace fs = std::filesystem;
using powerpoint::PrintOptions;
using testing::HasSubstr;
using testing::Not;

namespace {

using Change = std::function<void(PrintOptions&)>;
using Sizes = std::vector<std::string>;

/// A word of each slide of the deck that is not hidden, in the order of the slides.
const std::vector<std::string> SlideWords = {"surprises", "comes",  "folder", "night",
                                             "numbers",   "places", "helps",  "Questions?"};
constexpr int Slides = 8;

class PresentationTest : public OfficeTest {
protected:
    /// Prints the deck.
    /// @return the file
    fs::path Print(const Change& change) {
        fs::path output = m_files / "deck.ps";
        EXPECT_EQ(L"",
                  PrintPresentation(SamplePath("deck.pptx"), WidePath(output), Printer, change));
        return output;
    }
};

/// The number of the slide whose word stands in each place of the sheets: sheet after sheet, and
/// in a sheet row after row. 0 where there is none.
std::vector<int> SlidesByPlace(const fs::path& file, int columns, int rows) {
    const std::vector<PrintedWord> words = PostScriptWords(file);
    const int places = columns * rows;
    const int sheets = (Slides + places - 1) / places;
    std::vector<int> found(static_cast<std::size_t>(sheets) * static_cast<std::size_t>(places));
    for (const PrintedWord& word : words) {
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
    NEEDS_LIBREOFFICE();
    struct Case {
        LONG outputType, order;
        int columns, rows;
        std::vector<int> slides;
    };
    const std::vector<Case> cases = {
        {2, 1, 1, 2, {1, 2, 3, 4, 5, 6, 7, 8}},
        {2, 2, 1, 2, {1, 2, 3, 4, 5, 6, 7, 8}},
        {3, 1, 1, 3, {1, 2, 3, 4, 5, 6, 7, 8, 0}},
        {3, 2, 1, 3, {1, 2, 3, 4, 5, 6, 7, 8, 0}},
        {8, 1, 2, 2, {1, 2, 3, 4, 5, 6, 7, 8}},
        {8, 2, 2, 2, {1, 3, 2, 4, 5, 7, 6, 8}},
        {4, 1, 2, 3, {1, 2, 3, 4, 5, 6, 7, 8, 0, 0, 0, 0}},
        {4, 2, 2, 3, {1, 4, 2, 5, 3, 6, 7, 0, 8, 0, 0, 0}},
        {9, 1, 3, 3, {1, 2, 3, 4, 5, 6, 7, 8, 0}},
        {9, 2, 3, 3, {1, 4, 7, 2, 5, 8, 3, 6, 0}},
    };
    for (const Case& each : cases) {
        const fs::path output = Print([&](PrintOptions& options) {
            options.PutOutputType(each.outputType);
            options.PutHandoutOrder(each.order);
        });
        EXPECT_EQ(each.slides, SlidesByPlace(output, each.columns, each.rows))
            << "type " << each.outputType << ", order " << each.order;
        const auto sheets = each.slides.size() / static_cast<std::size_t>(each.columns * each.rows);
        EXPECT_EQ(Sizes(sheets, "595x842"), PostScriptPageSizes(output));
    }
}

TEST_F(PresentationTest, PrintsWhatTheOptionsAskFor) {
    NEEDS_LIBREOFFICE();
    struct Case {
        const char* name;
        Change change;
        Sizes sizes;
        std::vector<const char*> words, otherWords;
    };
    const std::vector<Case> cases = {
        {"slides", {}, Sizes(8, "960x540"), {"Größe", "Nobody"}, {"Until", "Welcome", "Marlo"}},
        {"hidden",
         [](PrintOptions& o) { o.PutPrintHiddenSlides(1); },
         Sizes(9, "960x540"),
         {"Until last year"},
         {}},
        {"fit", [](PrintOptions& o) { o.PutFitToPage(1); }, Sizes(8, "842x595"), {"Größe"}, {}},
        {"comments",
         [](PrintOptions& o) { o.PutPrintComments(1); },
         {"960x540", "960x540", "960x540", "960x540", "960x540", "960x540", "960x540", "960x540",
          "595x842"},
         {"Ada Quill, 2025-02-11", "Marlo?", "Łódź!"},
         {}},
        {"notes",
         [](PrintOptions& o) { o.PutOutputType(5); },
         Sizes(8, "540x780"),
         {"Welcome everybody", "Questions?"},
         {"Show this only"}},
        {"all notes",
         [](PrintOptions& o) {
             o.PutOutputType(5);
             o.PutPrintHiddenSlides(1);
         },
         Sizes(9, "540x780"),
         {"Welcome everybody", "Show this only"},
         {}},
        {"outline",
         [](PrintOptions& o) { o.PutOutputType(6); },
         {"595x842"},
         {"surprises", "For new colleagues", "mostly A4", "Пловдив", "Questions?"},
         {"Nobody", "Until", "Welcome", "Marlo"}},
        {"whole outline",
         [](PrintOptions& o) {
             o.PutOutputType(6);
             o.PutPrintHiddenSlides(1);
         },
         {"595x842"},
         {"Until last year"},
         {}},
    };
    for (const Case& each : cases) {
        const fs::path output = Print(each.change);
        EXPECT_EQ(each.sizes, PostScriptPageSizes(output)) << each.name;
        const std::string text = PostScriptText(output);
        for (const char* words : each.words)
            EXPECT_THAT(text, HasSubstr(words)) << each.name;
        for (const char* words : each.otherWords)
            EXPECT_THAT(text, Not(HasSubstr(words))) << each.name;
    }
}

TEST_F(PresentationTest, ColoursAreThoseThatAreAskedFor) {
    NEEDS_LIBREOFFICE();
    constexpr std::size_t Cyan = 0;
    constexpr std::size_t Black = 3;
    constexpr std::size_t FlowSlide = 2;
    constexpr std::size_t DarkSlide = 3;
    const auto inkWith = [&](LONG colour) {
        const fs::path output = Print([&](PrintOptions& o) { o.PutPrintColorType(colour); });
        EXPECT_THAT(PostScriptText(output), HasSubstr("At night")) << "it is no text any more";
        auto ink = PostScriptInk(output);
        ink.resize(Slides);
        return ink;
    };
    EXPECT_GT(inkWith(1)[FlowSlide][Cyan], 0.05);
    const auto gray = inkWith(2);
    const auto blackAndWhite = inkWith(3);
    for (int slide = 0; slide < Slides; ++slide) {
        for (const auto& ink : {gray.at(static_cast<std::size_t>(slide)),
                                blackAndWhite.at(static_cast<std::size_t>(slide))})
            EXPECT_EQ(0, ink[0] + ink[1] + ink[2]) << "slide " << slide + 1;
    }
    EXPECT_GT(gray[FlowSlide][Black], 0.1);
    EXPECT_GT(gray[DarkSlide][Black], 0.9);
    EXPECT_LT(blackAndWhite[FlowSlide][Black], 0.05); // white boxes
    EXPECT_LT(blackAndWhite[DarkSlide][Black], 0.05); // black words on a white ground
    EXPECT_GT(blackAndWhite[DarkSlide][Black], 0.001);
}

TEST_F(PresentationTest, FramesGoAroundTheSlides) {
    NEEDS_LIBREOFFICE();
    const fs::path output = Print([](PrintOptions& options) {
        options.PutOutputType(2);
        options.PutFrameSlides(1);
    });
    // The last two slides do not reach their upper edges without.
    EXPECT_THAT(PostScriptBounds(output, 4), testing::MatchesRegex("4[45] 8[45] 55[01] 75[78]"));
}

TEST_F(PresentationTest, WhatCannotBeDoneIsRaised) {
    NEEDS_LIBREOFFICE();
    const std::vector<std::pair<Change, const wchar_t*>> changes = {
        {[](PrintOptions& o) { o.PutOutputType(7); }, L"OutputType cannot be 7."},
        {[](PrintOptions& o) { o.PutPrintColorType(0); }, L"PrintColorType cannot be 0."},
        {[](PrintOptions& o) { o.PutHandoutOrder(3); }, L"HandoutOrder cannot be 3."},
        {[](PrintOptions& o) { o.PutActivePrinter(L"Nowhere"); },
         L"There is no printer named Nowhere."},
    };
    for (const auto& [change, reason] : changes)
        EXPECT_EQ(reason,
                  PrintPresentation(SamplePath("deck.pptx"), PathOf("never.ps"), Printer, change));
    EXPECT_FALSE(fs::exists(m_files / "never.ps"));
}
