#include "host/program/watch/FolderScan.h"

#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>

namespace fs = std::filesystem;
using namespace std::chrono_literals;
using testing::ElementsAre;
using testing::IsEmpty;
using testing::UnorderedElementsAre;

namespace {

using Names = std::vector<std::string>;

class FolderScanTest : public testing::Test {
protected:
    FolderScanTest() {
        m_rules.folder = m_folder.Path();
        m_rules.settle = 2s;
        m_rules.extensions = {"doc"};
    }

    /// What is told of by a scan, some time after the last one.
    Names ScanAfter(std::chrono::milliseconds passed) {
        m_now += passed;
        m_result = m_scan.value().Scan(m_now);
        Names names;
        for (const SettledFile& file : m_result.settled)
            names.push_back(file.path.lexically_relative(m_folder.Path()).generic_u8string());
        return names;
    }

    void Begin() { m_scan.emplace(m_rules); }

    TemporaryFolder m_folder;
    FolderScan::Rules m_rules;
    std::optional<FolderScan> m_scan;
    FolderScan::Clock::time_point m_now{1h};
    ScanResult m_result;
};

TEST_F(FolderScanTest, AFileIsToldOnceWhenTwoScansFarEnoughApartSawItTheSame) {
    m_folder.Write("a.doc", "half");
    Begin();
    EXPECT_THAT(ScanAfter(0s), IsEmpty()) << "seen for the first time";
    EXPECT_EQ(m_result.settling, 1U);
    EXPECT_EQ(m_result.next, std::chrono::milliseconds(2s));
    EXPECT_THAT(ScanAfter(1500ms), IsEmpty());
    EXPECT_EQ(m_result.next, 500ms);
    m_folder.Write("a.doc", "all of it");
    EXPECT_THAT(ScanAfter(500ms), IsEmpty()) << "it has become another";
    EXPECT_THAT(ScanAfter(2s), ElementsAre("a.doc"));
    EXPECT_EQ(m_result.settling, 0U);
    EXPECT_THAT(ScanAfter(10s), IsEmpty()) << "told already";
    m_scan->Forget();
    ScanAfter(0s);
    EXPECT_THAT(ScanAfter(2s), ElementsAre("a.doc"));
    fs::rename(m_folder / "a.doc", m_folder / "away");
    EXPECT_THAT(ScanAfter(2s), IsEmpty());
    fs::rename(m_folder / "away", m_folder / "a.doc");
    ScanAfter(1s);
    EXPECT_THAT(ScanAfter(2s), ElementsAre("a.doc")) << "put back to be tried again";
}

TEST_F(FolderScanTest, WhatIsNoDocumentIsNotSeen) {
    for (const char* const name :
         {".hidden.doc", "~$a.doc", "._a.doc", "a.doc.part", "b.tmp", "c.txt", "Thumbs.db", "doc"})
        m_folder.Write(name, "content");
    for (const char* const folder : {"processed", "failed", ".git", "@eaDir"}) {
        fs::create_directory(m_folder / folder);
        m_folder.Write(std::string(folder) + "/old.doc", "content");
    }
    m_folder.Write("A.DOC", "content");
    std::error_code unable; // not every system has links for everybody
    fs::create_symlink("/etc/passwd", m_folder / "link.doc", unable);
    fs::create_directory_symlink(m_folder / "processed", m_folder / "folder", unable);
    Begin();
    ScanAfter(0s);
    EXPECT_THAT(ScanAfter(2s), ElementsAre("A.DOC"));
    m_rules.takesOthers = true;
    Begin();
    ScanAfter(0s);
    EXPECT_THAT(ScanAfter(2s), UnorderedElementsAre("A.DOC", "c.txt", "doc"));
}

TEST_F(FolderScanTest, AnEmptyFileAndOneThatIsOpenTakeLonger) {
    m_folder.Write("empty.doc", "");
    for (const char* const name : {"letter.doc", "~$tter.doc", "b.doc", ".~lock.b.doc#"})
        m_folder.Write(name, "content");
    Begin();
    ScanAfter(0s);
    EXPECT_THAT(ScanAfter(2s), IsEmpty());
    fs::remove(m_folder / "~$tter.doc");
    fs::remove(m_folder / ".~lock.b.doc#");
    EXPECT_THAT(ScanAfter(2s), UnorderedElementsAre("letter.doc", "b.doc"));
    EXPECT_THAT(ScanAfter(55s), IsEmpty());
    EXPECT_THAT(ScanAfter(1s), ElementsAre("empty.doc"));
}

TEST_F(FolderScanTest, AFolderMayBeAJob) {
    fs::create_directories(m_folder / "job/more");
    m_folder.Write("job/b.doc", "content");
    m_folder.Write("single.doc", "content");
    for (const bool folderIsJob : {false, true}) {
        m_rules.folderIsJob = folderIsJob;
        Begin();
        fs::remove(m_folder / "job/more/a.doc");
        ScanAfter(0s);
        m_folder.Write("job/more/a.doc", "content");
        EXPECT_EQ(ScanAfter(2s),
                  folderIsJob ? Names{"single.doc"} : (Names{"job/b.doc", "single.doc"}));
        EXPECT_EQ(ScanAfter(2s),
                  folderIsJob ? (Names{"job/b.doc", "job/more/a.doc"}) : Names{"job/more/a.doc"});
        EXPECT_EQ(m_result.settled.back().inside, "job/more");
    }
}

TEST_F(FolderScanTest, AFolderThatCannotBeSeenHasNotLostItsFiles) {
    fs::create_directory(m_folder / "in");
    m_folder.Write("in/a.doc", "content");
    m_rules.folder = m_folder / "in";
    Begin();
    ScanAfter(0s);
    ScanAfter(2s);
    fs::rename(m_folder / "in", m_folder / "away");
    EXPECT_THAT(ScanAfter(2s), IsEmpty());
    EXPECT_TRUE(m_result.error);
    fs::rename(m_folder / "away", m_folder / "in");
    EXPECT_THAT(ScanAfter(2s), IsEmpty()) << "told already";
    EXPECT_FALSE(m_result.error);
}

} // namespace
