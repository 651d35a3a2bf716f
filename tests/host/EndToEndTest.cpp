#include "tests/host/ConvertRun.h"

#include <wx/utils.h>

#include <tuple>

namespace fs = std::filesystem;

namespace {

/// What there is on the machine, in ScriptedMachine's words.
constexpr char Machine[] = R"(key HKCR\CLSID\{6B1F0A51-2F0E-4D55-9A01-5E2D8C100009}
text HKCR\CLSID\{6B1F0A51-2F0E-4D55-9A01-5E2D8C100009}\InprocServer32||)" PRINTING_WORD R"(
text HKCR\CLSID\{6B1F0A51-2F0E-4D55-9A01-5E2D8C100009}\InprocServer32|ThreadingModel|Both
text HKCR\Word.Application||A Word that prints
text HKCR\Word.Application\CLSID||{6B1F0A51-2F0E-4D55-9A01-5E2D8C100009}
text HKCR\Word.Application\CurVer||Word.Application.16
text HKLM\SOFTWARE\Orvanta\Marlo Quillon|InstallPath|)" TEST_INSTALLATION R"(
text HKLM\SOFTWARE\Adobe\Acrobat Distiller\9.0|JobOptionsFolder|)" TEST_PROFILES R"(
flag HKCU\Software\Scripted Bridge|MakesPdf
)";

/// The program as it is installed, with the office filter itself, a Word that prints and a
/// Distiller's bridge that makes files.
class EndToEndTest : public ConvertRun {
protected:
    void SetUp() override { Change(""); }

    void TearDown() override {
        UnregisterStandIn(TEST_OFFICE "/ScriptedMachine");
        wxUnsetEnv("SCRIPTED_MACHINE");
    }

    /// @param more changes of the machine
    static void Change(const std::string& more) {
        wxSetEnv("SCRIPTED_MACHINE", wxString::FromUTF8(Machine + more));
    }

    static RunResult Run(const Arguments& arguments) {
        Arguments command = {QUILLON_PROGRAM, "--json", "--stand-ins", TEST_OFFICE};
        command.insert(command.end(), arguments.begin(), arguments.end());
        return RunProgram(command);
    }

    RunResult ConvertByFilter(const fs::path& document, const Arguments& options) const {
        Arguments arguments = {"convert", "--out", Out(), document.u8string()};
        arguments.insert(arguments.end(), options.begin(), options.end());
        return Run(arguments);
    }
};

TEST_F(EndToEndTest, ADocumentComesOutAsPostScriptAndAsPdf) {
    const std::string printed = "%!PS-Adobe-3.0";
    fs::copy_file(TEST_SAMPLES "/letter.docx", m_folder / "letter.docx");
    for (const auto& [options, output, head] :
         {std::tuple(Arguments{"--ps"}, "letter.ps", printed),
          {{"--pdf", "--profile", "press"}, "letter.pdf", "%PDF-1.4\n%" + printed}}) {
        const RunResult run = ConvertByFilter(m_folder / "letter.docx", options);
        EXPECT_EQ(run.exitCode, 0) << run.out << run.err;
        const nlohmann::json document = run.Records("document").at(0);
        EXPECT_EQ(document["state"], "converted") << document;
        EXPECT_EQ(document["output"], OutputPath(output));
        EXPECT_EQ(Output(output).substr(0, head.size()), head);
    }
}

TEST_F(EndToEndTest, ADocumentThatIsNoneIsRefused) {
    const fs::path broken = m_folder.Write("broken.doc", "no compound file");
    EXPECT_EQ(ConvertByFilter(broken, {}).Records("document").at(0)["code"], -1005);
    EXPECT_EQ(Outputs(), Names{});
}

TEST_F(EndToEndTest, TheBridgeFindsTheProfilesThatTheFilterLists) {
    const fs::path bin = fs::u8path(QUILLON_PROGRAM).parent_path();
    if (!fs::exists(bin / "Filters/orv_dist.dll"))
        GTEST_SKIP() << "there is no stand-in for Distiller on this system";
    m_folder.Write("Old.joboptions", "<< /CompatibilityLevel 1.3 >> setdistillerparams");
    Change("text HKLM\\SOFTWARE\\Orvanta\\Marlo Quillon|InstallPath|" + bin.string() +
           "\ntext HKLM\\SOFTWARE\\Orvanta\\Distiller Stand-In|Engine|Ghostscript" +
           "\ntext HKLM\\SOFTWARE\\Adobe\\Acrobat Distiller\\9.0|JobOptionsFolder|" +
           m_folder.Path().string());
    const RunResult run = ConvertByFilter(TEST_SAMPLES "/letter.docx", {"--profile", "old"});
    EXPECT_EQ(run.exitCode, 0) << run.err;
    EXPECT_EQ(Output("letter.pdf").substr(0, 8), "%PDF-1.3");
}

TEST_F(EndToEndTest, NothingContradictsWhatStatusSays) {
    fs::create_directories(m_folder / "Distiller/Settings");
    m_folder.Write("Distiller/Settings/Old.joboptions", "");
    // Windows has one registry for all programs: another test's may have left it there.
    const std::string noExcel = "delete HKCR\\Excel.Application\n";
    const std::string noWord = "delete HKCR\\Word.Application\n";
    const std::string adobe = " HKLM\\SOFTWARE\\Adobe\\Acrobat Distiller\\";
    const struct {
        std::string machine; ///< what becomes of the one with Word and Distiller
        bool isReady;        ///< the filter's word
        int statusCode;
        const char* told; ///< by status
        const char* document;
        int code;
        int exitCode; ///< for the document
    } cases[] = {
        {"", true, 0, "Ready to convert doc docx.", "letter.doc", 0, 0},
        {noWord + "key HKCR\\Word.Application", false, 2, "No Office application is installed",
         "letter.doc", -1006, 2}, // what an uninstaller leaves
        {"delete" + adobe + "9.0\ntext" + adobe + "5.0|InstallPath|" +
             (m_folder / "Distiller").u8string(),
         true, 0, "profile Old.joboptions", "letter.docx", 0, 0},
        {noWord + "key HKLM\\SOFTWARE\\Microsoft\\Office\\8.0\\Publisher", true, 2,
         "too old to be driven", "publication.pub", 1023, 2},
        {"text HKCR\\Word.Application\\CurVer||Word.Application.11", true, 0,
         "Ready to convert doc.", "letter.docx", -1006, 2},
        {"", true, 0, "Ready to convert doc docx.", "book.xls", 1014, 2},
    };
    for (const auto& each : cases) {
        Change(noExcel + each.machine);
        const RunResult status = Run({"status"});
        EXPECT_EQ(status.exitCode, each.statusCode) << status.err;
        EXPECT_EQ(status.Records("filter").at(0)["ready"], each.isReady) << status.err;
        EXPECT_THAT(status.err, HasSubstr(each.told));
        const fs::path document = fs::u8path(TEST_SAMPLES) / each.document;
        const RunResult screen = Run({"screen", document.u8string()});
        const RunResult convert = ConvertByFilter(document, {});
        for (const RunResult& run : {screen, convert}) {
            EXPECT_EQ(run.Records("document").at(0)["code"], each.code) << run.err;
            EXPECT_EQ(run.exitCode, each.exitCode) << each.machine;
        }
        UnregisterStandIn(TEST_OFFICE "/ScriptedMachine");
    }
}

} // namespace
