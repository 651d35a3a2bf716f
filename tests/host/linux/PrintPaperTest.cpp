// The paper of a print server's queue, and the kind of file that it prints as it is.

#include "tests/host/WatchRun.h"
#include "tests/support/linux/CupsServer.h"

#include <fstream>

namespace fs = std::filesystem;

namespace {

/// A printer with Letter and A5, and white edges.
constexpr const char* Description = R"ppd(*PPD-Adobe: "4.3"
*FormatVersion: "4.3"
*FileVersion: "1.0"
*LanguageVersion: English
*LanguageEncoding: ISOLatin1
*PCFileName: "PAPER.PPD"
*Product: "(Paper)"
*PSVersion: "(3010.000) 0"
*Manufacturer: "Test"
*ModelName: "Paper"
*ShortNickName: "Paper"
*NickName: "Paper"
*LanguageLevel: "3"
*ColorDevice: True
*OpenUI *PageSize: PickOne
*DefaultPageSize: Letter
*PageSize A5: ""
*PageSize Letter: ""
*CloseUI: *PageSize
*OpenUI *PageRegion: PickOne
*DefaultPageRegion: Letter
*PageRegion A5: ""
*PageRegion Letter: ""
*CloseUI: *PageRegion
*DefaultImageableArea: Letter
*ImageableArea A5: "10 10 410 585"
*ImageableArea Letter: "30 40 590 780"
*DefaultPaperDimension: Letter
*PaperDimension A5: "420 595"
*PaperDimension Letter: "612 792"
)ppd";

class PrintPaperTest : public WatchRun {
protected:
    void SetUp() override {
        const std::string obstacle = CupsServer::Obstacle("/usr/sbin/cupsd");
        if (!obstacle.empty())
            GTEST_SKIP() << obstacle;
        m_server.AddBackend("paper", "echo \"$CONTENT_TYPE\" >>" + Paper().string());
        m_server.Start();
    }

    void AddQueue(const std::string& name, const std::string& more) {
        m_server.AddQueue(name, "paper:/", m_folder.Write(name + ".ppd", Description + more));
    }

    fs::path Paper() const { return m_server.Folder() / "out/paper"; }

    CupsServer m_server;
};

/// An area of a sheet, in points from its lower left corner.
struct Area {
    int left = 0, bottom = 0, right = 0, top = 0;
};

/// What PostScript says of its sheets.
struct Sheets {
    std::string paper; ///< the first one's
    Area drawn;        ///< where anything is
};

Sheets SheetsOf(const fs::path& postScript) {
    std::ifstream file(postScript);
    Sheets sheets;
    std::string word;
    while ((sheets.paper.empty() || sheets.drawn.top == 0) && file >> word)
        if (word == "%%BoundingBox:")
            file >> sheets.drawn.left >> sheets.drawn.bottom >> sheets.drawn.right >>
                sheets.drawn.top;
        else if (word == "%%DocumentMedia:")
            for (int i = 0; i < 3 && file >> word; ++i) // its name and its size
                sheets.paper = i == 2 ? sheets.paper + 'x' + word : word;
    return sheets;
}

TEST_F(PrintPaperTest, SheetsAreThoseOfTheQueue) {
    AddQueue("letter", "");
    AddQueue("any", "*VariablePaperSize: True\n*CustomPageSize True: \"\"\n");
    const Area upright = {30, 40, 590, 780};
    const Area turned = {40, 30, 752, 590}; // whichever way
    const struct {
        const char* queue;
        const char* output;
        std::map<std::string, std::string> papers;
    } rows[] = {
        {"letter", "Slides", {{"letter.docx", "612x792"}, {"deck.pptx", "792x612"}}},
        {"letter", "Handouts", {{"deck.pptx", "612x792"}}},
        {"letter", "Outline View", {{"deck.pptx", "612x792"}}},
        {"any", "Handouts", {{"letter.docx", "595x842"}, {"deck.pptx", "612x792"}}},
    };
    for (const auto& row : rows) {
        Arguments command = {QUILLON_PROGRAM, "convert", "--ps", "--out", Path("out")};
        command.insert(command.end(), {"--printer", row.queue, "--set"});
        command.push_back(std::string("PRINTOUTPUTTYPE=") + row.output);
        for (const auto& [document, paper] : row.papers)
            command.push_back(TEST_SAMPLES "/" + document);
        const RunResult run = RunProgram(command);
        EXPECT_EQ(run.exitCode, 0) << run.err;
        for (const auto& [document, paper] : row.papers) {
            SCOPED_TRACE(row.queue + (", " + document) + " as " + row.output);
            const Sheets sheets = SheetsOf((m_folder / "out" / document).replace_extension(".ps"));
            EXPECT_EQ(sheets.paper, paper);
            const Area& white = paper == "792x612" ? turned : upright;
            EXPECT_GE(sheets.drawn.left, white.left);
            EXPECT_GE(sheets.drawn.bottom, white.bottom);
            EXPECT_LE(sheets.drawn.right, white.right);
            EXPECT_LE(sheets.drawn.top, white.top);
        }
    }
}

TEST_F(PrintPaperTest, PdfForTheQueueAloneIsNotDelivered) {
    AddQueue("letter", "*cupsFilter2: \"application/pdf application/pdf 0 -\"\n");
    const struct {
        const char* settings;
        Names output;
    } rows[] = {{"[folder.set]\nOUTPUTFILETYPEPS = '1'\n", {"a.ps"}}, {"", {"a.pdf", "a.ps"}}};
    std::string printed;
    for (const auto& row : rows) {
        Configure("on_same_name = 'replace'\n[folder.print]\nqueue = 'letter'\nkeep = true\n" +
                  std::string(row.settings));
        Put("a.doc", "output=pdf");
        const RunResult run = WatchOnce();
        EXPECT_EQ(run.exitCode, 0) << run.err;
        EXPECT_EQ(FilesIn("out"), row.output);
        EXPECT_EQ(ReadBytes(Paper()), printed += "application/pdf\n");
    }
    EXPECT_EQ(
        RunQuillon({"convert", Path("in/processed/a.doc"), "--print", "letter", "--wait"}).exitCode,
        0);
    EXPECT_EQ(ReadBytes(Paper()), printed += "application/pdf\n");
}

} // namespace
