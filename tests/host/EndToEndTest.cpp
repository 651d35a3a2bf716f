#include "tests/host/ConvertRun.h"

#include <tuple>

namespace fs = std::filesystem;

namespace {

/// The program as it is installed, with the office filter itself, a Word that prints and a
/// Distiller's bridge that makes files.
class EndToEndTest : public ConvertRun {
protected:
    void TearDown() override {
        UnregisterStandIn(TEST_OFFICE "/PrintingWord");
        UnregisterStandIn(TEST_OFFICE "/PrintingDistiller");
    }

    RunResult ConvertByFilter(const std::string& document, const Arguments& options) const {
        Arguments command = {
            QUILLON_PROGRAM, "convert", "--json", "--stand-ins",
            TEST_OFFICE,     "--out",   Out(),    (m_folder / document).u8string()};
        command.insert(command.end(), options.begin(), options.end());
        return RunProgram(command);
    }
};

TEST_F(EndToEndTest, ADocumentComesOutAsPostScriptAndAsPdf) {
    const std::string printed = "%!PS-Adobe-3.0";
    fs::copy_file(TEST_DOCUMENT, m_folder / "letter.docx");
    for (const auto& [options, output, head] :
         {std::tuple(Arguments{"--ps"}, "letter.ps", printed),
          {{"--pdf", "--profile", "press"}, "letter.pdf", "%PDF-1.4\n%" + printed}}) {
        const RunResult run = ConvertByFilter("letter.docx", options);
        EXPECT_EQ(run.exitCode, 0) << run.out << run.err;
        const nlohmann::json document = run.Records("document").at(0);
        EXPECT_EQ(document["state"], "converted") << document;
        EXPECT_EQ(document["output"], OutputPath(output));
        EXPECT_EQ(Output(output).substr(0, head.size()), head);
    }
}

TEST_F(EndToEndTest, ADocumentThatIsNoneIsRefused) {
    m_folder.Write("broken.doc", "no compound file");
    EXPECT_EQ(ConvertByFilter("broken.doc", {}).Records("document").at(0)["code"], -1005);
    EXPECT_EQ(Outputs(), Names{});
}

} // namespace
