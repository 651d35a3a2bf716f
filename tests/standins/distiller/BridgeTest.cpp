#include "tests/standins/distiller/BridgeTest.h"

#include "common/LoadedModule.h"

namespace fs = std::filesystem;

std::string WordsProgram(const std::string& words) {
    return "%!PS\n/Helvetica findfont 24 scalefont setfont 72 600 moveto (" + words +
           ") show showpage\n";
}

const std::string PictureProgram = R"(%!PS
72 100 translate 72 72 scale
/row 1800 string def
600 600 8 [600 0 0 -600 0 600] { 0 1 1799 { row exch rand 256 mod put } for row }
false 3 colorimage
initgraphics
)" + WordsProgram("Words in a common font");

BridgeTest::BridgeTest() : StandInTest(DISTILLER_MODULE, "SOFTWARE\\Orvanta\\Distiller Stand-In") {}

void BridgeTest::SetUp() {
    StandInTest::SetUp();
    if (Engine().empty())
        GTEST_SKIP() << "Ghostscript is not installed";
}

int BridgeTest::Convert(const fs::path& postScript, const fs::path& pdf,
                        const std::string& profile) {
    const std::u16string psPath = postScript.u16string();
    const std::u16string pdfPath = pdf.u16string();
    const std::u16string profileName = fs::path(profile).u16string();
    // By its offsets, as another's program fills it.
    const char16_t* const record[5] = {psPath.c_str(), pdfPath.c_str(), profileName.c_str()};
    return CallBridge(record);
}

int BridgeTest::CallBridge(const void* record) {
    const LoadedModule bridge(wxString::FromUTF8(BRIDGE));
    auto* const convert = bridge.Find<std::int32_t(const void*)>("DIST_convertFile");
    EXPECT_TRUE(convert);
    return convert ? convert(record) : -1;
}

std::string BridgeTest::Failure(const std::string& program, const std::string& profile) {
    const fs::path postScript = m_files.Write("failing.ps", program);
    const fs::path pdf = m_files / "failed.pdf";
    const std::set<std::string> names = Names();
    const int result = Convert(postScript, pdf, profile);
    EXPECT_NE(0, result) << program;
    EXPECT_EQ(names, Names()) << program;
    EXPECT_EQ("", Leftovers()) << program;
    EXPECT_EQ(1U, m_log.size()) << program;
    const std::string reason = ReasonUnless(result == 0);
    const std::string start =
        postScript.string() + " cannot be converted to " + pdf.string() + ": ";
    EXPECT_EQ(0U, reason.rfind(start, 0)) << reason;
    return reason.substr(std::min(reason.size(), start.size()));
}
