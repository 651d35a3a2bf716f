#include "pstools/PS2PDF.h"

#include "host/services/Log.h"
#include "tests/filter/ComOnThisThread.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/bridge/BridgeScript.h"

#include <gmock/gmock.h>

#include <optional>
#include <thread>

namespace {

using testing::AllOf;
using testing::HasSubstr;
using testing::Not;

constexpr char Before[] = "Before Calling DIST_convertFile for /out/a.ps\n";
constexpr char After[] = "After Calling DIST_convertFile for /out/a.ps\n";

class PS2PDFTest : public testing::Test {
protected:
    PS2PDFTest() { EXPECT_TRUE(Log::ToFile(m_folder / "log")); }

    static bool Convert() { return ConvertPS2PDF("/out/a.ps", "/out/a.pdf", L"Press.joboptions"); }
    std::string LogText() const { return ReadBytes(m_folder / "log"); }

    TemporaryFolder m_folder;
    std::optional<BridgeScript> m_bridge{std::in_place, m_folder.Path().wstring()};
};

TEST_F(PS2PDFTest, HandsTheRequestToTheBridge) {
    EXPECT_TRUE(Convert());
    EXPECT_TRUE(m_bridge->WasCalledProperly());
    EXPECT_THAT(LogText(), AllOf(HasSubstr(Before), HasSubstr(After)));
    const wxString odd = wxString::FromUTF8("\xd0\x96 \xf0\x9f\x98\x80;'\n");
    EXPECT_TRUE(ConvertPS2PDF(odd, odd + ".pdf", L""));
    EXPECT_EQ(odd, m_bridge->PSPath());
    EXPECT_EQ(odd + ".pdf", m_bridge->PDFPath());
    EXPECT_EQ(wxString(), m_bridge->Profile()); // empty, and not a null address
}

TEST_F(PS2PDFTest, TakesAnyAnswerButZeroForAFailure) {
    for (const long answer : {5L, 1L, -1L}) {
        m_bridge->Answer(answer);
        EXPECT_FALSE(Convert());
    }
    EXPECT_THAT(LogText(), HasSubstr(After));
}

TEST_F(PS2PDFTest, SurvivesABridgeThatThrows) {
    m_bridge->Throw();
    std::thread([] { // the toolkit may have COM in use on the main thread
        EXPECT_FALSE(Convert());
        EXPECT_FALSE(IsComInitialised());
    })
        .join();
    EXPECT_THAT(LogText(), AllOf(HasSubstr(Before), Not(HasSubstr(After))));
}

TEST_F(PS2PDFTest, FailsInSilenceWithoutABridge) {
    const auto bridge = m_folder / "Filters" / "orv_dist.dll";
    std::filesystem::copy_file(FILTER_MODULE, bridge, // a module, but not one with the export
                               std::filesystem::copy_options::overwrite_existing);
    EXPECT_FALSE(Convert());
    m_folder.Write("Filters/orv_dist.dll", "no module");
    EXPECT_FALSE(Convert());
    std::filesystem::remove(bridge);
    EXPECT_FALSE(Convert());
    m_bridge.reset(); // takes the registry's entry with it
    EXPECT_FALSE(Convert());
    EXPECT_EQ("", LogText());
}

} // namespace
