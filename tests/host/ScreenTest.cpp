#include "tests/host/ScreenRun.h"

#include <gtest/gtest.h>

namespace fs = std::filesystem;

namespace {

using nlohmann::json;
using namespace std::string_literals;

TEST_F(ScreenTest, TellsWhatIsWrongWithAFile) {
    ExpectRefused(m_folder / "none.doc", -1002, "no such file");
    ExpectRefused(m_folder / std::string(300, 'n').append(".doc"), -1002, "too long");
    ExpectRefused(m_folder.Write("empty.doc", ""), -1005, "empty");
    ExpectRefused(m_folder.Write("note.txt", "text"), -1005,
                  "no filter takes files ending in .txt");
    ExpectRefused(m_folder.Write("noending", "text"), -1005, "without an ending");
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
}

TEST_F(ScreenTest, AnyNameComesBackExactAndIsShownOnOneLine) {
    const std::pair<std::string, std::string> names[] = {
        {"with space; and 'quotes' \".doc", "with space; and 'quotes' \".doc"},
        {"two\nlines\t.doc", "two\\nlines\\t.doc"},
        {"\x1b[31mred.doc", "\\x1b[31mred.doc"},
        {"\xD0\x9F\xD0\xB8\xD1\x81\xD1\x8C\xD0\xBC\xD0\xBE \xF0\x9F\x98\x80.doc",
         "\xD0\x9F\xD0\xB8\xD1\x81\xD1\x8C\xD0\xBC\xD0\xBE \xF0\x9F\x98\x80.doc"},
        {"[draft].doc", "[draft].doc"},
        {std::string(250, 'l') + ".doc", std::string(250, 'l') + ".doc"},
    };
    for (const auto& [name, shown] : names) {
        const std::string path = m_folder.Write(name, "script").string();
        const RunResult run = RunQuillon({"screen", "--json", path});
        ASSERT_EQ(run.Records("document").size(), 1U) << run.err;
        EXPECT_EQ(run.Records("document")[0]["input"], path);
        EXPECT_NE(run.err.find('/' + shown + ": "), std::string::npos) << run.err;
    }
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

TEST_F(ScreenTest, ANameThatIsNoTextIsRefusedAndNotLost) {
    for (const char* name : {"br\xFC"
                             "cke.doc",
                             "half\xED\xA0\x80.doc", "over\xC0\xAF.doc"}) {
        const fs::path path = m_folder.Write(name, "script");
        ExpectRefused(path, -1005, "not valid UTF-8");
        std::string hex;
        for (const char byte : path.string())
            hex += "0123456789abcdef"s[static_cast<unsigned char>(byte) >> 4U],
                hex += "0123456789abcdef"s[static_cast<unsigned char>(byte) & 15U];
        EXPECT_EQ(Screen(path, 1)["inputBytes"], hex);
    }
    const RunResult run = RunQuillon({"screen", (m_folder / "br\xFC"
                                                            "cke.doc")
                                                    .string()});
    EXPECT_NE(run.out.find("/br\\xfccke.doc: refused"), std::string::npos) << run.out;
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
        seen.push_back(fs::path(document["input"].get<std::string>()).filename().string() + ' ' +
                       document["state"].get<std::string>());
    EXPECT_EQ(seen, (std::vector<std::string>{"a.xls accepted", "b.doc refused", "c.docx accepted",
                                              "readme.txt skipped"}));
    EXPECT_EQ(run.Records("summary")[0], (json{{"type", "summary"},
                                               {"accepted", 2},
                                               {"refused", 1},
                                               {"skipped", 1},
                                               {"exitCode", 1}}));
}

TEST_F(ScreenTest, EachFileCountsOnceAndAnEmptyFolderIsDone) {
    const std::string file = m_folder.Write("a.doc", "script").string();
    const RunResult run =
        RunQuillon({"screen", "--json", file, m_folder.Path().string() + "/./a.doc",
                    m_folder.Path().string()});
    EXPECT_EQ(run.Records("document").size(), 1U);
    fs::create_directory(m_folder / "empty");
    const RunResult idle = RunQuillon({"screen", (m_folder / "empty").string()});
    EXPECT_EQ(idle.exitCode, 0);
    EXPECT_NE(idle.out.find("Nothing to do"), std::string::npos);
}

} // namespace
