#include "tests/standins/LoopbackListener.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/Packages.h"
#include "tests/standins/Viewers.h"

#include <wx/base64.h>

#include <functional>

namespace fs = std::filesystem;

namespace {

/// With a LibreOffice for so many documents.
class LinkedContentTest : public OfficeTest, public testing::WithParamInterface<long> {
protected:
    void SetUp() override {
        OfficeTest::SetUp();
        SetLimit("DocumentsPerStart", GetParam());
    }
};

INSTANTIATE_TEST_SUITE_P(Engines, LinkedContentTest, testing::Values(1, 100));

/// A picture in SVG that has others in it, each of which covers it.
std::string PictureOf(const std::vector<std::string>& addresses) {
    std::string picture = R"(<svg xmlns="http://www.w3.org/2000/svg" width="90" height="90"
        xmlns:xlink="http://www.w3.org/1999/xlink"><rect width="50" height="50" fill="#f0f"/>)";
    for (const std::string& address : addresses)
        picture += R"(<image width="90" height="90" xlink:href=")" + address + R"("/>)";
    return picture + "</svg>";
}

const std::string CyanPng = "iVBORw0KGgoAAAANSUhEUgAAAAEAAAABCAIAAACQd1PeAAAADElEQVR4nGNg"
                            "+P8fAAMBAf+2EqLVAAAAAElFTkSuQmCC";

/// Files of the user's, all of them cyan.
std::vector<fs::path> WriteSecrets(const TemporaryFolder& folder) {
    const wxMemoryBuffer png = wxBase64Decode(CyanPng);
    return {
        folder.Write("secret.png", {static_cast<const char*>(png.GetData()), png.GetDataLen()}),
        folder.Write("secret.svg",
                     R"(<svg xmlns="http://www.w3.org/2000/svg" width="90" height="90">
            <rect width="90" height="90" fill="#0ff"/></svg>)"),
        folder.Write("secret.pdf", "%PDF-1.4\n1 0 obj<</Type/Catalog/Pages 2 0 R>>endobj\n"
                                   "2 0 obj<</Type/Pages/Kids[3 0 R]/Count 1>>endobj\n"
                                   "3 0 obj<</Type/Page/Parent 2 0 R/MediaBox[0 0 90 90]"
                                   "/Contents 4 0 R>>endobj\n"
                                   "4 0 obj<</Length 25>>stream\n0 1 1 rg 0 0 90 90 re f  \n"
                                   "endstream endobj\ntrailer<</Root 1 0 R>>\n%%EOF\n"),
    };
}

} // namespace

TEST_P(LinkedContentTest, NothingOfOtherFilesIsPrinted) {
    const LoopbackListener listener;
    std::vector<std::string> others = {"http://127.0.0.1:" + std::to_string(listener.Port()) +
                                       "/picture.png"};
    const TemporaryFolder users;
    for (const fs::path& secret : WriteSecrets(users))
        others.insert(others.end(), {"file://" + secret.string(), secret.string()});
    const std::pair<const char*, std::function<std::string(const std::string&)>> kinds[] = {
        {"docx",
         [](const auto& svg) { return WithPart("letter.docx", "word/media/rId2.png", svg); }},
        {"pptx",
         [](const auto& svg) { return WithPart("deck.pptx", "ppt/media/rId9-1.png", svg); }},
        {"xlsx", [](const auto& svg) { return Package("picture-workbook", svg); }},
    };
    for (const auto& [kind, document] : kinds) {
        const auto ink = [&, name = std::string("picture.") + kind,
                          make = document](const std::vector<std::string>& addresses) {
            const fs::path path = m_files.Write(name, make(PictureOf(addresses)));
            EXPECT_EQ("", Print(path));
            return InkOf(PrintedFile(path));
        };
        const NumbersOfPages without = ink({});
        EXPECT_NE(without, ink({"data:image/png;base64," + CyanPng})) << kind; // its own is printed
        EXPECT_EQ(without, ink(others)) << kind;
    }
    EXPECT_FALSE(listener.HasVisitor());
}

TEST_P(LinkedContentTest, NoRequestLeavesADocument) {
    const LoopbackListener listener;
    const std::string picture =
        "http://127.0.0.1:" + std::to_string(listener.Port()) + "/picture.png";
    EXPECT_EQ("", Print(m_files.Write("link.docx", Package("linked-document", picture))));
    EXPECT_FALSE(listener.HasVisitor());
}
