#include "tests/standins/OfficePrints.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/PostScriptText.h"
#include "tests/support/CompoundFile.h"

#include <gmock/gmock.h>

namespace fs = std::filesystem;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

/// Excel, PowerPoint and Publisher, each by the extension of the document.
class ApplicationsTest : public OfficeTest {
protected:
    std::wstring Print(const std::wstring& path, const std::wstring& printer = Printer) {
        const std::wstring output = PathOf("out.ps");
        const std::wstring extension = path.substr(path.rfind(L'.') + 1);
        if (extension == L"pub")
            return PrintPublication(path, output, printer);
        return extension[0] == L'x' ? PrintWorkbook(path, output, printer)
                                    : PrintPresentation(path, output, printer);
    }
    std::wstring PrintBytes(const std::string& name, const std::string& bytes) {
        return Print(WidePath(m_files.Write(name, bytes)));
    }
};

std::string Repeated(std::size_t count, const std::string& size) {
    std::string sizes;
    for (std::size_t i = 0; i < count; ++i)
        sizes += size + " ";
    return sizes;
}

} // namespace

TEST_F(ApplicationsTest, PrintEveryFormatOfTheirs) {
    NEEDS_LIBREOFFICE();
    struct Case {
        const char* document;
        std::string sizes;
        std::vector<const char*> words; ///< from the first page to the last
    };
    const std::vector<const char*> bookWords = {"What the paper cost", "Pages printed", "M12"};
    const std::vector<const char*> deckWords = {"surprises", "Пловдив", "156,050", "Questions?"};
    const std::vector<const char*> showWords = {"Open day", "A press of 1911", "Come in"};
    const std::vector<Case> cases = {
        {"book.xlsx", "595x842 595x842 842x595 ", bookWords},
        {"book.xls", "595x842 595x842 842x595 ", bookWords},
        {"deck.pptx", Repeated(8, "960x540"), deckWords},
        {"deck.ppt", Repeated(8, "960x540"), deckWords},
        {"show.ppsx", Repeated(3, "960x540"), showWords},
        {"show.pps", Repeated(3, "960x540"), showWords},
        {"publication.pub", Repeated(2, "595x842"), {"Ditto with more text", "Table on page 2"}},
    };
    for (const Case& each : cases) {
        EXPECT_EQ(L"", Print(SamplePath(each.document))) << each.document;
        std::string sizes;
        for (const std::string& size : PostScriptPageSizes(m_files / "out.ps"))
            sizes += size + " ";
        EXPECT_EQ(each.sizes, sizes) << each.document;
        const std::string text = PostScriptText(m_files / "out.ps");
        for (const char* words : each.words)
            EXPECT_THAT(text, HasSubstr(words)) << each.document;
        EXPECT_EQ(L"There is no printer named Nowhere.",
                  Print(SamplePath(each.document), L"Nowhere"))
            << each.document;
    }
}

TEST_F(ApplicationsTest, RefuseWhatIsNoDocument) {
    NEEDS_LIBREOFFICE();
    CompoundFile compound;
    compound.AddStream(u"Contents", std::string(5000, 'x'));
    const std::string deck = ReadBytes(SamplePath("deck.pptx"));
    const std::string publication = ReadBytes(SamplePath("publication.pub"));
    for (const std::string extension : {"xls", "xlsx", "ppt", "pptx", "pps", "ppsx"}) {
        EXPECT_THAT(PrintBytes("garbage." + extension, "No document at all, whatever its name."),
                    HasSubstr(L"cannot load it"))
            << extension;
        EXPECT_THAT(PrintBytes("compound." + extension, compound.Bytes()),
                    HasSubstr(L"cannot load it"))
            << extension;
    }
    EXPECT_THAT(PrintBytes("garbage.pub", "No document at all."), HasSubstr(L"not a publication"));
    EXPECT_THAT(PrintBytes("really a letter.pub", ReadBytes(SamplePath("letter.doc"))),
                HasSubstr(L"not a publication"));
    EXPECT_THAT(PrintBytes("compound.pub", compound.Bytes()), HasSubstr(L"cannot load it"));
    EXPECT_THAT(PrintBytes("truncated.pub", publication.substr(0, 3000)),
                StartsWith(L"truncated.pub cannot be opened"));
    EXPECT_THAT(PrintBytes("really a deck.xlsx", deck), HasSubstr(L"another application"));
    EXPECT_THAT(PrintBytes("really a book.ppt", ReadBytes(SamplePath("book.xls"))),
                HasSubstr(L"cannot load it"));
    EXPECT_FALSE(fs::exists(m_files / "out.ps"));
}
