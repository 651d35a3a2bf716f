#include "pstools/PS2PDF.h"

#include "host/services/Log.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/bridge/BridgeScript.h"

#include <objbase.h>

#include <wx/filename.h>

#include <gtest/gtest.h>

#include <optional>
#include <thread>

namespace {

class PS2PDFTest : public testing::Test {
protected:
    PS2PDFTest() { EXPECT_TRUE(Log::ToFile(m_folder / "log")); }

    bool Convert(const wxString& profile = "Press.joboptions") {
        return ConvertPS2PDF("/out/a.ps", "/out/a.pdf", profile.wc_str());
    }

    /// How often the log says so.
    int Logged(const std::string& text) const {
        int count = 0;
        const std::string log = ReadBytes(m_folder / "log");
        for (std::size_t at = log.find(text); at != std::string::npos; at = log.find(text, at + 1))
            ++count;
        return count;
    }

    static constexpr char Before[] = "Before Calling DIST_convertFile for /out/a.ps\n";
    static constexpr char After[] = "After Calling DIST_convertFile for /out/a.ps\n";

    TemporaryFolder m_folder;
    std::optional<BridgeScript> m_bridge{std::in_place, m_folder.Path().wstring()};
};

TEST_F(PS2PDFTest, HandsTheRequestToTheBridge) {
    m_bridge->Answer(0);
    EXPECT_TRUE(Convert());
    EXPECT_EQ("/out/a.ps", m_bridge->PSPath());
    EXPECT_EQ("/out/a.pdf", m_bridge->PDFPath());
    EXPECT_EQ("Press.joboptions", m_bridge->Profile());
    EXPECT_TRUE(m_bridge->WasCalledProperly());
    EXPECT_EQ(1, Logged(Before));
    EXPECT_EQ(1, Logged(After));

    const wxString odd = wxString::FromUTF8("\xd0\x96 \xf0\x9f\x98\x80;'\n");
    EXPECT_TRUE(ConvertPS2PDF(odd, odd, L""));
    EXPECT_EQ(odd, m_bridge->PSPath());
    EXPECT_EQ(wxString(), m_bridge->Profile()); // empty, and not a null address
}

TEST_F(PS2PDFTest, PassesTheBridgesFailureOn) {
    for (const long result : {5L, 1L, -1L}) {
        m_bridge->Answer(result);
        EXPECT_FALSE(Convert());
    }
    EXPECT_EQ(3, Logged(Before));
    EXPECT_EQ(3, Logged(After));
}

TEST_F(PS2PDFTest, SurvivesABridgeThatThrows) {
    m_bridge->Throw();
    std::thread([this] { // the toolkit may have COM in use on the main thread
        EXPECT_FALSE(Convert());
        const CLSID unknown{};
        void* object = nullptr;
        EXPECT_EQ(CO_E_NOTINITIALIZED,
                  CoCreateInstance(unknown, nullptr, CLSCTX_ALL, IID_IUnknown, &object));
    })
        .join();
    EXPECT_EQ(1, Logged(Before));
    EXPECT_EQ(0, Logged(After));
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
    EXPECT_EQ("", ReadBytes(m_folder / "log"));
}

} // namespace
