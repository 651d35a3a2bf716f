#include "host/program/watch/WatchConfiguration.h"

#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>

#include <fstream>

namespace fs = std::filesystem;
using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

class WatchConfigurationTest : public testing::Test {
protected:
    /// @return why the text is no configuration; empty when it is one
    std::string FaultOf(const std::string& text) const {
        Fault fault;
        const fs::path file = m_folder.Write("watch.toml", text);
        if (ReadWatchConfiguration(file, fault))
            return {};
        EXPECT_EQ(fault.blame, Blame::Usage);
        const std::string what = fault.what.utf8_string();
        return what.substr(what.rfind(file.u8string(), 0) == 0 ? file.u8string().size() : 0);
    }

    TemporaryFolder m_folder;
};

TEST_F(WatchConfigurationTest, AWholeOneIsReadAsItIsMeant) {
    const fs::path file = m_folder.Write("watch.toml", R"(# all that there is
journal = "kept/journal.db"
jobs = 3
http = "[::1]:80"
[[folder]]
name = "letters"
in = "letters/"
out = "/srv/../srv/out"
settings = "letters.xml"
set = { SLIDESPERPAGE = "9", FRAMESLIDES = true, PRINTER = "Floor 2" }
lang = "en_GB"
priority = 100
order = "name"
job = "folder"
on_same_name = "replace"
others = "pass"
settle = "500ms"
retries = []
keep_processed = "forever"
[[folder]]
in = "b\u00fccher"
out = "out"
[defaults]
settle = "10s"
retries = ["30s", "2h"]
keep_processed = "14d"
min_free = "500M"
)");
    Fault fault;
    const auto read = ReadWatchConfiguration(file, fault);
    ASSERT_TRUE(read) << fault.what;
    EXPECT_EQ(read->journal, (m_folder / "kept" / "journal.db").u8string());
    EXPECT_EQ(read->jobs, 3U);
    EXPECT_EQ(read->http, "[::1]:80");
    EXPECT_EQ(read->minFree, 500U << 20U);
    ASSERT_EQ(read->folders.size(), 2U);
    const FolderConfiguration& letters = read->folders[0];
    EXPECT_EQ(letters.name, "letters");
    EXPECT_EQ(letters.in, m_folder / "letters");
    EXPECT_EQ(letters.out, m_folder.Path().root_path() / "srv" / "out");
    EXPECT_EQ(letters.settings, m_folder / "letters.xml");
    EXPECT_THAT(letters.assignments,
                ElementsAre("SLIDESPERPAGE=9", "FRAMESLIDES=1", "PRINTER=Floor 2"));
    EXPECT_EQ(letters.language, "en");
    EXPECT_EQ(letters.priority, 100);
    EXPECT_TRUE(letters.byName && letters.folderIsJob);
    EXPECT_EQ(letters.onSameName, OnSameName::Replace);
    EXPECT_EQ(letters.others, Others::Pass);
    EXPECT_EQ(letters.settle, 500ms);
    EXPECT_TRUE(letters.retries.empty());
    EXPECT_EQ(letters.keepProcessed, std::nullopt);
    const FolderConfiguration& books = read->folders[1];
    EXPECT_EQ(books.name, L"b\u00fccher");
    EXPECT_EQ(books.priority, 50);
    EXPECT_FALSE(books.byName || books.folderIsJob || books.settings);
    EXPECT_EQ(books.settle, 10s);
    EXPECT_THAT(books.retries, ElementsAre(30s, 2h));
    EXPECT_EQ(books.keepProcessed, 24h * 14);
    EXPECT_EQ(books.language, std::nullopt);
}

TEST_F(WatchConfigurationTest, AWrongOneIsToldWithItsPlace) {
    const std::string folder = "[[folder]]\nin = \"in\"\nout = \"out\"\n"; // 3 lines
    const struct {
        std::string text;
        std::string place;
        std::string reason;
    } cases[] = {
        {"", ":1:1: ", "no folder to watch"},
        {"jobs = ", ":1:8: ", "end-of-file"},
        {"jobs = 2\njobs = 3\n", ":2:", "redefine"},
        {"joural = \"x\"\n" + folder, ":1:1: ", "did you mean \"journal\"?"},
        {"colour = 1\n" + folder, ":1:1: ", R"("defaults", "folder", "http", "jobs", "journal")"},
        {"jobs = \"4\"\n" + folder, ":1:8: ", "jobs: it must be a whole number from 0 to 64"},
        {"jobs = 65\n" + folder, ":1:8: ", "from 0 to 64"},
        {"jobs = 99999999999999999999\n", ":1:", "not representable"},
        {"http = \"9188\"\n" + folder, ":1:8: ", "HOST:PORT"},
        {"http = \"localhost:65536\"\n" + folder, ":1:8: ", "HOST:PORT"},
        {"journal = \"\"\n" + folder, ":1:11: ", "must not be empty"},
        {"journal = \"in/journal\"\n" + folder, ":1:11: ", "the folder \"in\" watches"},
        {"queue = \"db\"\n" + folder, ":1:9: ", "the URL of a database"},
        {"queue = \"postgres://db\"\njournal = \"x\"\n" + folder, ":2:1: ", "keep one of them"},
        {"lease = \"30s\"\n" + folder, ":1:1: ", "of use with a \"queue\" only"},
        {"queue = \"postgres://db\"\nlease = \"1s\"\n" + folder, ":2:9: ", "\"3s\""},
        {"queue = \"postgres://db\"\n[map]\nd = \"/d\"\n" + folder, ":3:1: ", "no name for a"},
        {"defaults = 1\n" + folder, ":1:12: ", "a table"},
        {"[defaults]\npriority = 1\n" + folder, ":2:1: ", "\"keep_processed\", \"lang\""},
        {"[defaults]\nmin_free = \"1 GB\"\n" + folder, ":2:12: ", "K, M, G or T"},
        {"[defaults]\nmin_free = \"99999999T\"\n" + folder, ":2:12: ", "K, M, G or T"},
        {"[defaults]\nmin_free = -1\n" + folder, ":2:12: ", "K, M, G or T"},
        {"folder = \"in\"\n", ":1:10: ", "a list"},
        {"folder = [ \"in\" ]\n", ":1:12: ", "a table"},
        {"[[folder]]\nout = \"out\"\n", ":1:1: ", "no \"in\""},
        {"[[folder]]\nin = \"in\"\n", ":1:1: ", "no \"out\""},
        {"[[folder]]\nin = \"/\"\nout = \"out\"\n", ":1:1: ", "no \"name\""},
        {folder + "in = \"b\"\n", ":4:", "redefine"},
        {folder + "name = \"a\\nb\"\n", ":4:8: ", "one line"},
        {folder + "settings = \"a\\u0000b\"\n", ":4:12: ", "the character 0"},
        {folder + "priority = 0\n", ":4:12: ", "from 1 to 100"},
        {folder + "priority = 1.5\n", ":4:12: ", "a whole number"},
        {folder + "order = \"size\"\n", ":4:9: ", R"(one of these: "arrival", "name")"},
        {folder + "job = true\n", ":4:7: ", R"("file", "folder")"},
        {folder + "on_same_name = \"\"\n", ":4:16: ", R"("number", "replace")"},
        {folder + "others = \"keep\"\n", ":4:10: ", R"("leave", "fail", "pass")"},
        {folder + "lang = \"tlh\"\n", ":4:8: ", "the languages are: "},
        {folder + "settle = 2\n", ":4:10: ", R"(a time from "0ms" to "1h")"},
        {folder + "settle = \"2 s\"\n", ":4:10: ", "with ms, s, m, h or d"},
        {folder + "settle = \"61m\"\n", ":4:10: ", "to \"1h\""},
        {folder + "retries = \"30s\"\n", ":4:11: ", "a list"},
        {folder + "retries = [\"30s\",\n \"0s\"]\n", ":5:2: ", R"(from "1s" to "7d")"},
        {folder + "keep_processed = \"9999999999999999999d\"\n", ":4:18: ", "a time"},
        {folder + "min_free = \"1G\"\n", ":4:1: ", "no key \"min_free\""},
        {folder + "set = { SLIDESPERPAG = 6 }\n", ":4:9: ", "did you mean \"SLIDESPERPAGE\"?"},
        {folder + "set = { SLIDESPERPAGE = 5 }\n", ":4:25: ", R"("4", "6", "9")"},
        {folder + "set = { COLOR = \"Pink\" }\n", ":4:17: ", "\"Grayscale\""},
        {folder + "set = \"COLOR=Grayscale\"\n", ":4:7: ", "a table"},
        {folder + folder, ":4:1: ", "another folder with the name \"in\""},
        {folder + folder + "name = \"b\"\n", ":2:6: ", "the folder \"b\" has the same one"},
        {folder + "[[folder]]\nin = \"in/processed\"\nout = \"out\"\n",
         ":5:6: ", "it lies in that"},
        {"[[folder]]\nin = \"a\"\nout = \"a\"\n", ":3:7: ", "the output as documents"},
        {"[[folder]]\nin = \"a\"\nout = \"a/../a/b\"\n", ":3:7: ", "the output as documents"},
        {folder + "[[folder]]\nin = \"b\"\nout = \"in/b\"\n",
         ":6:7: ", "the folder \"in\" watches"},
        {"[[folder]]\nin = \"r\xE9\"", "the configuration ", "not valid UTF-8"},
        {std::string(2 << 20, '#'), "the configuration ", "larger than"},
    };
    for (const auto& each : cases) {
        const std::string fault = FaultOf(each.text);
        EXPECT_THAT(fault, StartsWith(each.place)) << each.text;
        EXPECT_THAT(fault, HasSubstr(each.reason)) << each.text;
    }

    std::error_code error;
    fs::create_directory(m_folder / "real");
    fs::create_directory_symlink(m_folder / "real", m_folder / "link", error);
    if (!error) { // not everywhere is that for everybody
        EXPECT_THAT(FaultOf("[[folder]]\nin = \"link\"\nout = \"real/out\"\n"),
                    HasSubstr("the output as documents"));
    }
}

TEST_F(WatchConfigurationTest, TheInstalledExampleHoldsWhenItIsNoCommentAnyMore) {
    std::ifstream example(fs::path(TEST_SAMPLES).parent_path() / "packaging" / "watch.toml");
    std::string text;
    for (std::string line; std::getline(example, line);)
        text += line.substr(line.size() > 1 && line[0] == '#' && line[1] != ' ') + '\n';
    EXPECT_EQ(FaultOf(text), "");
    EXPECT_THAT(text, HasSubstr("[[folder]]\nname"));
}

TEST_F(WatchConfigurationTest, WhatIsNoFileIsToldAsWhatItIs) {
    Fault fault;
    EXPECT_FALSE(ReadWatchConfiguration(m_folder / "none", fault));
    EXPECT_THAT(fault.what.utf8_string(), HasSubstr("no such file"));
    EXPECT_FALSE(ReadWatchConfiguration(m_folder.Path(), fault));
    EXPECT_THAT(fault.what.utf8_string(), HasSubstr("it is a folder"));
}

} // namespace
