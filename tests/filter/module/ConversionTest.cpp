#include "tests/filter/module/FilterModule.h"
#include "tests/support/RecordingOffice.h"
#include "tests/support/TemporaryFolder.h"
#include "tests/support/TestPrinter.h"
#include "tests/support/bridge/BridgeScript.h"

#include <wx/sstream.h>
#include <wx/xml/xml.h>

#include <gtest/gtest.h>

#include <optional>

namespace {

class ConversionTest : public testing::Test {
protected:
    ConversionTest() {
        m_office.On("Document", 444, [this](const std::vector<std::wstring>& texts) {
            m_folder.Write(std::filesystem::path(texts.at(0)).filename(), "%!PS-Adobe-3.0\n");
        });
        m_plugin->Initialize(wxString());
        Apply("<r><UI><PRINTER>Printer</PRINTER><OUTPUTFILETYPEPS>1</OUTPUTFILETYPEPS></UI></r>");
    }

    void Apply(const char* xml) {
        wxStringInputStream stream(xml);
        wxXmlDocument document;
        ASSERT_TRUE(document.Load(stream, "UTF-8"));
        m_plugin->ApplySettings(document.GetRoot());
    }

    int Convert(const char* fileName, wxString& outputName) {
        JobItem item;
        item.fileName = fileName;
        item.paths.Add(wxString("/in/") + fileName);
        return m_plugin->Convert(nullptr, item, m_folder.Path().wstring(), outputName, nullptr);
    }

    TemporaryFolder m_folder;
    RecordingOffice m_office{{L"Word.Application"}};
    std::optional<TestPrinter> m_printer{std::in_place, L"Printer", L"Test driver",
                                         m_folder.Write("a.ppd", "x").wstring()};
    PluginUnderTest m_plugin;
};

TEST_F(ConversionTest, PrintsWordDocumentsAndNamesTheOutput) {
    for (const char* name : {"report.final.docx", "report.final.DOC"}) {
        wxString outputName;
        EXPECT_EQ(0, Convert(name, outputName));
        EXPECT_EQ("report.final.ps", outputName);
        EXPECT_EQ("%!PS-Adobe-3.0\n", ReadBytes(m_folder / "report.final.ps"));
        std::filesystem::remove(m_folder / "report.final.ps");
    }
}

TEST_F(ConversionTest, PassesTheDriversFailureOn) {
    m_office.On("Documents", 15, [](const auto&) { throw RecordingOffice::Raise{L"broken"}; });
    wxString outputName;
    EXPECT_EQ(1020, Convert("a.doc", outputName));
    EXPECT_EQ("a.ps", outputName);
    m_office.RefuseToStart();
    EXPECT_EQ(1016, Convert("a.doc", outputName));
}

TEST_F(ConversionTest, NeedsAPrinterInTheSettingsWhereThereIsNoDistiller) {
    const PluginUnderTest plugin;
    plugin->Initialize(wxString());
    plugin->ApplySettings(nullptr); // no printer there, and the one found is forgotten
    JobItem item;
    item.fileName = "a.doc";
    item.paths.Add("/in/a.doc");
    wxString outputName;
    EXPECT_EQ(-1010, plugin->Convert(nullptr, item, "/out", outputName, nullptr));
}

TEST_F(ConversionTest, MakesPdfUnlessPostScriptIsAskedFor) {
    BridgeScript bridge(m_folder.Path().wstring());
    const wxString psPath((m_folder / "a.ps").wstring());
    const wxString pdfPath((m_folder / "a.pdf").wstring());
    for (const char* psOutput : {"0", "true", "01"}) {
        Apply((std::string("<r><UI><OUTPUTFILETYPEPS>") + psOutput + "</OUTPUTFILETYPEPS></UI></r>")
                  .c_str());
        wxString outputName;
        EXPECT_EQ(0, Convert("a.doc", outputName));
        EXPECT_EQ("a.pdf", outputName);
    }
    EXPECT_EQ(3, bridge.Calls());
    EXPECT_EQ(psPath, bridge.PSPath());
    EXPECT_EQ(pdfPath, bridge.PDFPath());
    EXPECT_EQ(wxString(), bridge.Profile());
    EXPECT_TRUE(std::filesystem::exists(m_folder / "a.ps"));

    Apply("<r><UI><SELECTEDDISTILLERPROFILE>Press.joboptions</SELECTEDDISTILLERPROFILE></UI></r>");
    bridge.Answer(5);
    wxString outputName;
    EXPECT_EQ(-1007, Convert("a.doc", outputName));
    EXPECT_EQ("a.pdf", outputName);
    EXPECT_EQ("Press.joboptions", bridge.Profile());

    m_office.On("Documents", 15, [](const auto&) { throw RecordingOffice::Raise{L"broken"}; });
    EXPECT_EQ(1020, Convert("a.doc", outputName));
    EXPECT_EQ("a.ps", outputName);
    EXPECT_EQ(4, bridge.Calls()); // no PostScript, no PDF step
}

TEST_F(ConversionTest, PicksTheDriverByTheExtension) {
    wxString outputName;
    EXPECT_EQ(1014, Convert("a.XLSX", outputName));
    EXPECT_EQ(1014, Convert("a.xls", outputName));
    for (const char* name : {"a.ppt", "a.pps", "a.pptx", "a.PPSX"})
        EXPECT_EQ(1013, Convert(name, outputName)) << name;
    EXPECT_EQ(1015, Convert("a.pub", outputName));
}

TEST_F(ConversionTest, RefusesWithoutNamingAnOutput) {
    wxString outputName = "as it was";
    EXPECT_EQ(-1002, Convert("", outputName));
    JobItem pathless;
    pathless.fileName = "a.doc";
    EXPECT_EQ(-1002, m_plugin->Convert(nullptr, pathless, "/out", outputName, nullptr));
    EXPECT_EQ(-1005, Convert("a.txt", outputName));

    m_printer.reset();
    m_plugin->Initialize(wxString());
    for (const char* name :
         {"a.doc", "a.docx", "a.xls", "a.xlsx", "a.ppt", "a.pps", "a.pptx", "a.ppsx", "a.pub"})
        EXPECT_EQ(-1006, Convert(name, outputName)) << name;
    EXPECT_EQ("as it was", outputName);
    EXPECT_TRUE(m_office.Journal().empty());
}

} // namespace
