#include "tests/standins/OfficeTest.h"
#include "tests/standins/Viewers.h"

#include <gmock/gmock.h>

#include <algorithm>
#include <cctype>
#include <cstdlib>
#include <set>
#include <sstream>

namespace fs = std::filesystem;
using testing::HasSubstr;

namespace {

class ApplicationsTest : public OfficeTest {};

using Texts = std::vector<std::string>;

/// Has LibreOffice alone make PDF files of all samples, started once: of letter.doc,
/// letter-doc.pdf.
void ConvertSamples(const TemporaryFolder& folder) {
    std::string command = "soffice --headless -env:UserInstallation=file://" +
                          (folder / "profile").string() + " --convert-to pdf --outdir " +
                          folder.Path().string();
    for (const fs::directory_entry& sample : fs::directory_iterator(SAMPLES_FOLDER)) {
        const std::string ending = sample.path().extension();
        if (fs::is_directory(sample) || ending.size() < 4 || ending == ".LICENSE")
            continue;
        const std::string copy = sample.path().stem().string() + "-" + ending.substr(1) + ending;
        fs::copy_file(sample, folder / copy);
        command += " " + (folder / copy).string();
    }
    EXPECT_EQ(0, std::system((command + " >/dev/null 2>&1").c_str()));
}

/// The words of LibreOffice's own PDF that are not found in the text. Where words end, viewers do
/// not agree.
std::set<std::string> LostWords(const fs::path& own, std::string text) {
    text.erase(std::remove_if(text.begin(), text.end(),
                              [](unsigned char c) { return std::isspace(c) != 0; }),
               text.end());
    std::istringstream words(PdfText(own));
    std::set<std::string> lost;
    std::size_t count = 0;
    for (std::string word; words >> word; ++count)
        if (text.find(word) == std::string::npos)
            lost.insert(word);
    EXPECT_GT(count, 0U) << own;
    return lost;
}

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
    const TemporaryFolder own;
    ConvertSamples(own);
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
        const std::string ending = document.extension().string().substr(1);
        EXPECT_THAT(LostWords(own / (document.stem().string() + "-" + ending + ".pdf"), text),
                    testing::IsEmpty())
            << name;
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
