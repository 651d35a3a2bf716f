#include "tests/host/WatchRun.h"

#include <fstream>

namespace {

namespace fs = std::filesystem;
using nlohmann::json;
using testing::ElementsAre;

class WatchTest : public WatchRun {};

TEST_F(WatchTest, WhatIsDroppedInComesOutOnceAndWhatCannotIsToldWhy) {
    fs::create_directories(m_folder / "in/moved/in");
    Put("letter.doc");
    Put("broken.doc", "screen=-1005");
    Put("bad.doc", "convert=1020");
    Put("notes.txt", "nobody's");
    Put("moved/in/deep.doc");
    Configure("retries = ['1h']\n"); // longer than this run takes anywhere
    const RunResult run = WatchOnce();
    EXPECT_EQ(run.exitCode, 1) << run.err;
    EXPECT_THAT(FilesIn("out"), ElementsAre("letter.ps", "moved/in/deep.ps"));
    EXPECT_THAT(FilesIn("in"),
                ElementsAre("bad.doc", "failed/broken.doc", "failed/broken.doc.txt", "notes.txt",
                            "processed/letter.doc", "processed/moved/in/deep.doc"))
        << "what may come out better next time is still there";
    EXPECT_FALSE(fs::exists(m_folder / "in/moved")) << "nothing is in it any more";
    const std::string note = ReadBytes(m_folder / "in/failed/broken.doc.txt");
    EXPECT_THAT(note, HasSubstr("broken.doc could not be printed."));
    EXPECT_THAT(note, HasSubstr("Its content is not an Office document."));
    EXPECT_THAT(note, HasSubstr("quillon retry"));
    EXPECT_THAT(note, HasSubstr("Code: -1005"));
}

TEST_F(WatchTest, ADocumentThatFailsIsTriedAgainAsOftenAsTheConfigurationSays) {
    Put("bad.doc", "convert=1020");
    Put("unlucky.doc", "convert=1020\nonce=" + Path("once"));
    Configure();
    RunningProgram program(QuillonCommand(Watch()));
    AwaitFile(m_folder / "in/failed/bad.doc.txt");
    AwaitFile(m_folder / "in/processed/unlucky.doc");
    EXPECT_THAT(ReadBytes(m_folder / "in/failed/bad.doc.txt"), HasSubstr("Attempts: 2"));
    program.Terminate();
    const RunResult run = program.Wait();
    EXPECT_EQ(run.exitCode, 0) << run.err;
    EXPECT_THAT(FilesIn("out"), ElementsAre("unlucky.ps"));
}

TEST_F(WatchTest, TheSameNameMayComeAgain) {
    Configure();
    for (const char* const expected : {"letter.ps", "letter (2).ps", "letter (3).ps"}) {
        Put("letter.doc", std::string("again ") + expected);
        WatchOnce();
        EXPECT_TRUE(fs::exists(m_folder / "out" / expected)) << expected;
    }
    EXPECT_THAT(FilesIn("in"), ElementsAre("processed/letter (2).doc", "processed/letter (3).doc",
                                           "processed/letter.doc"));
    Configure("on_same_name = 'replace'\n");
    Put("letter.doc");
    WatchOnce();
    EXPECT_EQ(FilesIn("out").size(), 3U);
}

TEST_F(WatchTest, EachFolderHasItsSettingsAndChangesOfThemTakeEffect) {
    m_folder.Write("gray.xml", "<x><UI><COLOR>gray</COLOR></UI></x>");
    fs::create_directory(m_folder / "other");
    Configure("settings = 'gray.xml'\n[[folder]]\nin = 'other'\nout = 'out'\n"
              "set = { SLIDESPERPAGE = '6' }\nothers = 'pass'\n",
              "jobs = 1");
    Put("a.doc");
    m_folder.Write("other/b.doc", "script");
    m_folder.Write("other/as it is.txt", "text");
    RunningProgram program(QuillonCommand(Watch()));
    AwaitFile(m_folder / "in/processed/a.doc");
    AwaitFile(m_folder / "other/processed/b.doc");
    AwaitFile(m_folder / "other/processed/as it is.txt");
    m_folder.Write("gray.xml", "<x><UI><COLOR>colour</COLOR></UI></x>");
    Put("c.doc");
    AwaitFile(m_folder / "in/processed/c.doc");
    EXPECT_THAT(ReadBytes(m_folder / "out/a.ps"), HasSubstr("COLOR=gray"));
    EXPECT_THAT(ReadBytes(m_folder / "out/b.ps"), HasSubstr("SLIDESPERPAGE=6"));
    EXPECT_THAT(ReadBytes(m_folder / "out/b.ps"), testing::Not(HasSubstr("COLOR=gray")));
    EXPECT_THAT(ReadBytes(m_folder / "out/c.ps"), HasSubstr("COLOR=colour"));
    EXPECT_EQ(ReadBytes(m_folder / "out/as it is.txt"), "text");
}

TEST_F(WatchTest, ADocumentThatIsRewrittenMeanwhileIsConvertedAnew) {
    Put("a.doc", "started=" + Path("started") + "\nwait=" + Path("go"));
    Configure();
    RunningProgram program(QuillonCommand(Watch()));
    AwaitFile(m_folder / "started");
    Put("a.doc", "script, but another one");
    m_folder.Write("go", "");
    AwaitFile(m_folder / "in/processed/a.doc");
    EXPECT_THAT(FilesIn("out"), ElementsAre("a.ps"));
    EXPECT_EQ(ReadBytes(m_folder / "in/processed/a.doc"), "script, but another one");
}

TEST_F(WatchTest, ASecondWatcherIsRefused) {
    Configure();
    RunningProgram program(QuillonCommand(Watch()));
    AwaitFile(m_folder / "in/processed");
    const RunResult second = WatchOnce();
    EXPECT_EQ(second.exitCode, 3);
    EXPECT_THAT(second.err, HasSubstr("is watched already, by "));
}

TEST_F(WatchTest, AFolderThatIsAwayIsNotAnEmptyOne) {
    Configure();
    Put("a.doc");
    WatchOnce();
    fs::rename(m_folder / "in", m_folder / "away");
    EXPECT_EQ(WatchOnce().exitCode, 2);
    fs::create_directory(m_folder / "in"); // where a share is to be mounted
    Put("b.doc");
    EXPECT_EQ(WatchOnce().exitCode, 2);
    EXPECT_THAT(FilesIn("in"), ElementsAre("b.doc"));
    fs::remove_all(m_folder / "in");
    fs::rename(m_folder / "away", m_folder / "in");
    Put("c.doc");
    EXPECT_EQ(WatchOnce().exitCode, 0);
    EXPECT_THAT(FilesIn("out"), ElementsAre("a.ps", "c.ps"));
}

TEST_F(WatchTest, TheMachineIsNotTheDocumentsFault) {
    Put("a.doc", "convert=1020\nfault=machine\nreason=no room");
    Configure();
    const RunResult run = WatchOnce();
    EXPECT_EQ(run.exitCode, 2) << run.err;
    EXPECT_THAT(FilesIn("in"), ElementsAre("a.doc"));
    const json job = Ask({"queue"}).Records("job").at(0);
    EXPECT_EQ(job["state"], "waiting");
    EXPECT_EQ(job["attempts"], 0);
}

TEST_F(WatchTest, AFailedOneIsTriedAgainWhenSomebodySaysSo) {
    Put("a.doc", "screen=-1005\nonce=" + Path("once"));
    Configure();
    WatchOnce();
    EXPECT_THAT(FilesIn("in"), ElementsAre("failed/a.doc", "failed/a.doc.txt"));
    EXPECT_EQ(Ask({"retry", "--failed"}).exitCode, 0);
    EXPECT_EQ(WatchOnce().exitCode, 0);
    EXPECT_THAT(FilesIn("in"), ElementsAre("processed/a.doc"));
    EXPECT_EQ(Ask({"pause"}).exitCode, 0);
    Put("b.doc");
    WatchOnce();
    EXPECT_THAT(FilesIn("out"), ElementsAre("a.ps"));
    EXPECT_EQ(Ask({"resume"}).exitCode, 0);
    WatchOnce();
    EXPECT_THAT(FilesIn("out"), ElementsAre("a.ps", "b.ps"));
}

} // namespace
