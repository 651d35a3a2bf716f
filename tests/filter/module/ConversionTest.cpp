#include "tests/filter/module/FilterModule.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"
#include "tests/support/bridge/BridgeScript.h"

#include <gtest/gtest.h>

#include <optional>

namespace {

/// A machine with Word alone.
class ConversionTest : public testing::Test {
protected:
    ConversionTest() {
        m_office.On("Document", 444, [this](const std::vector<std::wstring>& texts) {
            m_folder.Write(std::filesystem::path(texts.at(0)).filename(), "%!PS-Adobe-3.0\n");
        });
        m_plugin->Initialize(wxString());
        Apply("<PRINTER>Printer</PRINTER>");
    }

    void Apply(const std::string& settings) {
        m_plugin->ApplySettings(XmlText("<r><UI>" + settings + "</UI></r>").GetRoot());
    }

    int Convert(const JobItem& item) {
        return m_plugin->Convert(nullptr, item, m_folder.Path().wstring(), m_outputName, nullptr);
    }
    int Convert(const char* fileName) { return Convert(ItemFor(wxString("/in/") + fileName)); }

    void RefuseDocuments() {
        m_office.On("Documents", 15, [](const auto&) { throw RecordingOffice::Raise{L"broken"}; });
    }

    TemporaryFolder m_folder;
    RecordingOffice m_office{{L"Word.Application"}};
    std::optional<TestPrinter> m_printer{std::in_place, L"Printer", L"Test driver",
                                         m_folder.Write("a.ppd", "x").wstring()};
    PluginUnderTest m_plugin;
    wxString m_outputName = "as it was";
};

TEST_F(ConversionTest, PicksTheDriverByTheExtension) {
    const std::pair<const char*, int> cases[] = {
        {"a.XLSX", 1014}, {"a.xls", 1014},  {"a.ppt", 1013}, {"a.pps", 1013},
        {"a.pptx", 1013}, {"a.PPSX", 1013}, {"a.pub", 1015}, {"a.txt", -1005},
    };
    for (const auto& [name, result] : cases)
        EXPECT_EQ(result, Convert(name)) << name;
}

TEST_F(ConversionTest, NeedsAPrinterInTheSettingsWhereThereIsNoDistiller) {
    const PluginUnderTest plugin;
    plugin->Initialize(wxString());
    plugin->ApplySettings(nullptr); // no printer there, and the one found is forgotten
    EXPECT_EQ(-1010, plugin->Convert(nullptr, ItemFor("/in/a.doc"), "/out", m_outputName, nullptr));
}

TEST_F(ConversionTest, MakesPdfUnlessPostScriptIsAskedFor) {
    BridgeScript bridge(m_folder.Path().wstring());
    for (const auto& [psOutput, outputName] : {std::pair<std::string, const char*>{"1", "a.ps"},
                                               {"0", "a.pdf"},
                                               {"true", "a.pdf"},
                                               {"01", "a.pdf"}}) {
        Apply("<OUTPUTFILETYPEPS>" + psOutput + "</OUTPUTFILETYPEPS>");
        EXPECT_EQ(0, Convert("a.doc"));
        EXPECT_EQ(outputName, m_outputName);
    }
    EXPECT_EQ(3, bridge.Calls());
    EXPECT_EQ(wxString((m_folder / "a.ps").wstring()), bridge.PSPath());
    EXPECT_EQ(wxString((m_folder / "a.pdf").wstring()), bridge.PDFPath());
    EXPECT_EQ(wxString(), bridge.Profile());
    EXPECT_EQ("%!PS-Adobe-3.0\n", ReadBytes(m_folder / "a.ps"));

    Apply("<SELECTEDDISTILLERPROFILE>Press.joboptions</SELECTEDDISTILLERPROFILE>");
    bridge.Answer(5);
    EXPECT_EQ(-1007, Convert("a.doc"));
    EXPECT_EQ("a.pdf", m_outputName);
    EXPECT_EQ("Press.joboptions", bridge.Profile());

    RefuseDocuments();
    EXPECT_EQ(1020, Convert("a.doc"));
    EXPECT_EQ("a.ps", m_outputName);
    EXPECT_EQ(4, bridge.Calls()); // no PostScript, no PDF step
}

TEST_F(ConversionTest, RefusesWithoutNamingAnOutput) {
    JobItem pathless;
    pathless.fileName = "a.doc";
    EXPECT_EQ(-1002, Convert(pathless));
    EXPECT_EQ(-1002, Convert(""));
    EXPECT_EQ(-1005, Convert("a.txt"));
    m_printer.reset();
    m_plugin->Initialize(wxString());
    EXPECT_EQ(-1006, Convert("a.doc"));
    EXPECT_EQ(-1006, Convert("a.pub"));
    EXPECT_EQ("as it was", m_outputName);
    EXPECT_TRUE(m_office.Journal().empty());
}

} // namespace
