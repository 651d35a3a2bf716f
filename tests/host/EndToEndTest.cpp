#include "tests/host/ConvertRun.h"

namespace fs = std::filesystem;

namespace {

/// The program as it is installed, with the office filter itself, and a Word that prints.
class EndToEndTest : public ConvertRun {
protected:
    void TearDown() override { UnregisterStandIn(TEST_OFFICE "/PrintingWord"); }

    RunResult ConvertByFilter(const std::string& document) const {
        return RunProgram({QUILLON_PROGRAM, "convert", "--json", "--ps", "--stand-ins", TEST_OFFICE,
                           "--out", Out(), (m_folder / document).u8string()});
    }
};

TEST_F(EndToEndTest, TheFilterHasWordPrintADocument) {
    fs::copy_file(TEST_DOCUMENT, m_folder / "letter.docx");
    const RunResult run = ConvertByFilter("letter.docx");
    EXPECT_EQ(run.exitCode, 0) << run.out << run.err;
    const nlohmann::json document = run.Records("document").at(0);
    EXPECT_EQ(document["state"], "converted") << document;
    EXPECT_EQ(document["output"], OutputPath("letter.ps"));
    EXPECT_EQ(Output("letter.ps").substr(0, 14), "%!PS-Adobe-3.0");

    m_folder.Write("broken.doc", "no compound file");
    EXPECT_EQ(ConvertByFilter("broken.doc").Records("document").at(0)["code"], -1005);
    EXPECT_EQ(Outputs(), Names{"letter.ps"});
}

} // namespace
