#include "tests/standins/OfficeTest.h"
#include "tests/standins/Viewers.h"

#include <gmock/gmock.h>

namespace fs = std::filesystem;
using testing::HasSubstr;

namespace {

class ApplicationsTest : public OfficeTest {};

using Texts = std::vector<std::string>;

} // namespace

TEST_F(ApplicationsTest, PrintEveryFormatOfTheirs) {
    struct {
        const char* document;
        Texts sizes;
        Texts words; ///< from the first page to the last
    } const cases[] = {
        {"letter.docx", {"595x842"}, {"New opening hours", "Größe", "Привет из Софии", "żółć"}},
        {"letter.doc", {"595x842"}, {"New opening hours"}},
        {"report.docx", {"595x842", "595x842", "842x595", "595x842"}, {"Machines"}},
        {"book.xlsx",
         {"595x842", "595x842", "842x595"},
         {"What the paper cost", "Pages printed", "M12"}},
        {"book.xls",
         {"595x842", "595x842", "842x595"},
         {"What the paper cost", "Pages printed", "M12"}},
        {"deck.pptx", Texts(8, "960x540"), {"surprises", "156,050", "Пловдив", "Questions?"}},
        {"deck.ppt", Texts(8, "960x540"), {"surprises", "156,050", "Пловдив", "Questions?"}},
        {"show.ppsx", Texts(3, "960x540"), {"Open day", "A press of 1911", "Come in"}},
        {"show.pps", Texts(3, "960x540"), {"Open day", "A press of 1911", "Come in"}},
        {"publication.pub", Texts(2, "595x842"), {"Ditto with more text", "Table on page 2"}},
    };
    for (const auto& [name, sizes, words] : cases) {
        const fs::path document = Sample(name);
        EXPECT_EQ("", Print(document)) << name;
        const std::string postScript = ReadBytes(PrintedFile(document));
        EXPECT_THAT(postScript, HasSubstr("%%Title: " + std::string(name) + "\n"));
        EXPECT_THAT(postScript, HasSubstr("%%Pages: " + std::to_string(sizes.size()) + "\n"));
        EXPECT_EQ(sizes, PdfPageSizes(DistilledByGhostscript(PrintedFile(document)))) << name;
        const std::string text = PostScriptText(PrintedFile(document));
        std::size_t place = 0;
        for (const std::string& word : words) {
            place = text.find(word, place);
            EXPECT_NE(std::string::npos, place) << word << " in " << text;
        }
    }
}

TEST_F(ApplicationsTest, NeedAPrinter) {
    m_printer = L"Nowhere";
    for (const char* document : {"letter.docx", "book.xlsx", "show.ppsx", "publication.pub"}) {
        EXPECT_THAT(Print(Sample(document)),
                    testing::EndsWith(": There is no printer named Nowhere."));
        EXPECT_FALSE(fs::exists(PrintedFile(Sample(document))));
    }
}
