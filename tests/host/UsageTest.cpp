#include "tests/host/Program.h"
#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>

#include <algorithm>

namespace fs = std::filesystem;

namespace {

using Arguments = std::vector<std::string>;

constexpr int ScreenLines = 24;

/// A run that cannot begin: it must end with code 3, say why, and convert nothing.
class UsageTest : public testing::Test {
protected:
    void SetUp() override {
        m_document = m_folder.Write("letter.doc", "script").u8string();
        fs::create_directory(m_folder / "out");
    }

    void ExpectRefusal(const Arguments& arguments, const std::string& reason) const {
        const RunResult run = RunQuillon(arguments);
        EXPECT_EQ(run.exitCode, 3) << testing::PrintToString(arguments);
        EXPECT_THAT(run.err, HasSubstr(reason));
        EXPECT_EQ(run.out, "") << testing::PrintToString(arguments);
        EXPECT_TRUE(fs::is_empty(m_folder / "out"));
    }

    Arguments Convert(const Arguments& more) const {
        Arguments arguments = {"convert", m_document, "--out", (m_folder / "out").u8string()};
        arguments.insert(arguments.end(), more.begin(), more.end());
        return arguments;
    }

    TemporaryFolder m_folder;
    std::string m_document;
};

TEST_F(UsageTest, OfTheCommandLine) {
    ExpectRefusal({"prnit"}, "A subcommand is required");
    ExpectRefusal({"status", "--jsno"}, "--jsno");
    ExpectRefusal({"screen"}, "PATH");
    ExpectRefusal({"convert", m_document}, "--out");
    ExpectRefusal({"status", "--engine-stall", "0"}, "--engine-stall");
    ExpectRefusal({"status", "--engine-limit", "soon"}, "--engine-limit");
    ExpectRefusal({"status", "--log", "/nowhere/log"}, "/nowhere/log");
    ExpectRefusal(Convert({"--set", "PRINTER"}), "KEY=VALUE");
    ExpectRefusal(Convert({"--set", "=x"}), "KEY=VALUE");
    ExpectRefusal(Convert({"--printer", "Nobody's"}), "Quillon PostScript File Printer");
    ExpectRefusal(Convert({"--set", "PRINTER=Nobody's"}), "no printer \"Nobody's\"");
    ExpectRefusal(Convert({"--profile", "Pres"}), "no Distiller profile \"Pres\"");
    ExpectRefusal(Convert({"--ps", "--pdf"}), "--pdf");
    ExpectRefusal(Convert({"--ps", "--profile", "Press"}), "--profile");
    ExpectRefusal(Convert({"-j", "0"}), "--jobs");
    ExpectRefusal(Convert({"--lang", "tlh"}), "de es fr ja en");
    ExpectRefusal({"settings"}, "--settings");
}

TEST_F(UsageTest, OfTheOutputFolder) {
    ExpectRefusal({"convert", m_document, "--out", m_document}, "a file, not a folder");
    ExpectRefusal({"convert", m_document, "--out", (m_folder / "a" / "b").u8string()},
                  "the folder above it does not exist");
}

TEST_F(UsageTest, OfTheSettingsFile) {
    std::string deep;
    for (int level = 0; level < 100000; ++level)
        deep += "<a>";
    std::string million;
    for (int level = 0; level < 1000000; ++level)
        million += "<a>";
    const std::pair<std::string, std::string> files[] = {
        {"", "no element found"},
        {"<Settings>\n<UI>\n<PRINTER>x</UI></Settings>", "line 3"},
        {"<Settings><PRINTER>x</PRINTER></Settings>", "no element \"UI\""},
        {"<ui><PRINTER>x</PRINTER></ui>", "no element \"UI\""},
        {"<!DOCTYPE UI [<!ENTITY a \"aaaa\">]><UI><COLOR>&a;</COLOR></UI>", "document type"},
        {"<?xml version=\"1.0\" encoding=\"klingon\"?><UI/>", "encoding"},
        {"\xFF\xFE\xFF", "line 1"},
        {deep, "nested deeper"},
        {million, "larger than"},
    };
    const std::string file = (m_folder / "settings.xml").u8string();
    for (const auto& [bytes, reason] : files) {
        m_folder.Write("settings.xml", bytes);
        ExpectRefusal(Convert({"--settings", file}), reason);
    }
    ExpectRefusal(Convert({"--settings", (m_folder / "none.xml").u8string()}), "no such file");
    ExpectRefusal(Convert({"--settings", m_folder.Path().u8string()}), "it is a folder");
    ExpectRefusal(Convert({"--settings", "/dev/zero"}), "cannot be used");
}

TEST_F(UsageTest, OfARecordReader) {
    const RunResult run = RunQuillon(Convert({"--json", "--printer", "Nobody's"}));
    EXPECT_EQ(run.exitCode, 3);
    ASSERT_EQ(run.Records("error").size(), 1U);
    EXPECT_THAT(run.Records("error")[0]["text"].get<std::string>(), HasSubstr("Nobody's"));
}

TEST_F(UsageTest, HelpSaysItAllFromEveryCommand) {
    const std::string help = RunQuillon({"--help"}).out;
    for (const char* word :
         {"status", "screen", "convert", "--settings", "--engine-stall", "SLIDESPERPAGE",
          "Exit codes", "budget.xls.pdf", "--lang", "--profile", "settings"})
        EXPECT_THAT(help, HasSubstr(word)) << word;
    const RunResult ofCommand = RunQuillon({"convert", "--help"});
    EXPECT_EQ(ofCommand.exitCode, 0);
    EXPECT_EQ(ofCommand.out, help);
}

TEST_F(UsageTest, NothingAskedForShowsOneScreenOfHelp) {
    const RunResult bare = RunProgram({QUILLON_PROGRAM});
    EXPECT_EQ(bare.exitCode, 3);
    EXPECT_EQ(bare.out, "");
    EXPECT_LE(std::count(bare.err.begin(), bare.err.end(), '\n'), ScreenLines) << bare.err;
    for (const char* word : {"status", "screen", "convert", "settings", "quillon --help"})
        EXPECT_THAT(bare.err, HasSubstr(word)) << word;
}

TEST_F(UsageTest, TellsTheVersion) {
    const RunResult version = RunQuillon({"--version"});
    EXPECT_EQ(version.exitCode, 0);
    EXPECT_EQ(version.out, "quillon 1.0.0.1\n");
}

} // namespace
