#include "tests/host/ScreenRun.h"

#include <wx/utils.h>

#include <gmock/gmock.h>

namespace fs = std::filesystem;

namespace {

using nlohmann::json;
using namespace std::string_literals;

TEST_F(ScreenTest, TellsWhatIsWrongWithAFile) {
    ExpectRefused(m_folder / "none.doc", -1002, "no such file");
    ExpectRefused(m_folder.Write("empty.doc", ""), -1005, "empty");
    ExpectRefused(m_folder.Write("note.txt", "text"), -1005,
                  "no filter takes files ending in .txt");
    ExpectRefused(m_folder.Write("noending", "text"), -1005, "without an ending");
    ExpectRefused(m_folder.Write("a.pubx", "text"), -1005, "no filter takes files ending in .pubx");
}

TEST_F(ScreenTest, TellsWhatAnInvalidFileIsInstead) {
    const std::string invalid = "\nscreen=-1005";
    ExpectRefused(m_folder.Write("a.doc", "PK\x03\x04" + invalid), -1005,
                  "ZIP package: probably a .docx renamed to .doc");
    ExpectRefused(m_folder.Write("b.docx", "PK\x03\x04" + invalid), -1005, "no .docx document");
    ExpectRefused(m_folder.Write("c.docx", "\xD0\xCF\x11\xE0\xA1\xB1\x1A\xE1" + invalid), -1005,
                  "password");
    ExpectRefused(m_folder.Write("d.xls", "\xD0\xCF\x11\xE0\xA1\xB1\x1A\xE1" + invalid), -1005,
                  "another application than .xls");
    ExpectRefused(m_folder.Write("e.doc", "{\\rtf1" + invalid), -1005, "Rich Text");
    ExpectRefused(m_folder.Write("f.DOC", "%PDF-1.4" + invalid), -1005, "PDF");
    ExpectRefused(m_folder.Write("g.doc", "random" + invalid), -1005, "not an Office document");
}

TEST_F(ScreenTest, AMissingApplicationIsTheMachinesFault) {
    for (const char* code : {"-1006", "-1010", "1012", "1019", "1023"})
        EXPECT_EQ(Screen(m_folder.Write("a.doc", "screen="s + code), 2)["code"], std::stoi(code));
    EXPECT_EQ(Screen(m_folder.Write("a.doc", "screen=1020"), 1)["code"], 1020);
    // What the filter's screening does not look at.
    EXPECT_EQ(Screen(m_folder.Write("a.pub", "script"), 2)["code"], 1015);
    wxSetEnv("SCRIPTED_FILTER_UNREADY", "1");
    EXPECT_EQ(Screen(m_folder.Write("a.doc", "script"), 2)["code"], -1006);
    wxUnsetEnv("SCRIPTED_FILTER_UNREADY");
}

TEST_F(ScreenTest, AnyNameComesBackExactAndIsShownOnOneLine) {
    for (const std::string& name :
         {"with space; and 'quotes'.doc"s,
          "\xD0\x9F\xD0\xB8\xD1\x81\xD1\x8C\xD0\xBC\xD0\xBE \xF0\x9F\x98\x80.doc"s, "[draft].doc"s,
          std::string(200, 'l') + ".doc"})
        ExpectShown(name, name);
}

TEST_F(ScreenTest, ANameIsNeverTakenForAnOptionAListOrACommand) {
    for (const char* name : {"[a,b] too", "-none.doc", "status", "convert"}) {
        const RunResult run = RunQuillon({"screen", "--json", "--", "[a,b]", name});
        EXPECT_EQ(run.exitCode, 1) << run.err;
        ASSERT_EQ(run.Records("document").size(), 2U) << name;
        EXPECT_EQ(run.Records("document")[0]["input"], "./[a,b]");
        EXPECT_EQ(run.Records("document")[1]["input"], name);
    }
}

TEST_F(ScreenTest, AFolderMeansTheFilesDirectlyInItOneByOne) {
    m_folder.Write("b.doc", "screen=-1005");
    m_folder.Write("a.xls", "script");
    m_folder.Write("c.docx", "script");
    m_folder.Write("readme.txt", "text");
    m_folder.Write(".hidden.doc", "script");
    m_folder.Write("~$c.docx", "lock");
    fs::create_directory(m_folder / "sub");
    m_folder.Write("sub/d.doc", "script");

    const RunResult run = RunQuillon({"screen", "--json", m_folder.Path().string()});
    EXPECT_EQ(run.exitCode, 1);
    std::vector<std::string> seen;
    for (const json& document : run.Records("document"))
        seen.push_back(fs::u8path(document["input"].get<std::string>()).filename().u8string() +
                       ' ' + document["state"].get<std::string>());
    EXPECT_EQ(seen, (std::vector<std::string>{"a.xls accepted", "b.doc refused", "c.docx accepted",
                                              "readme.txt skipped"}));
    EXPECT_EQ(run.Records("summary")[0], (json{{"type", "summary"},
                                               {"accepted", 2},
                                               {"refused", 1},
                                               {"skipped", 1},
                                               {"exitCode", 1}}));
}

TEST_F(ScreenTest, EachFileCountsOnceAndAnEmptyFolderIsDone) {
    const std::string file = m_folder.Write("a.doc", "script").u8string();
    const RunResult run =
        RunQuillon({"screen", "--json", file, m_folder.Path().string() + "/./a.doc",
                    m_folder.Path().string()});
    EXPECT_EQ(run.Records("document").size(), 1U);
    fs::create_directory(m_folder / "empty");
    const RunResult idle = RunQuillon({"screen", (m_folder / "empty").string()});
    EXPECT_EQ(idle.exitCode, 0);
    EXPECT_THAT(idle.out, HasSubstr("Nothing to do"));
}

} // namespace
