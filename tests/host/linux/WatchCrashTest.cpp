#include "tests/host/WatchRun.h"
#include "tests/host/linux/DyingProgram.h"

#include <csignal>

namespace {

using testing::ElementsAre;

class WatchCrashTest : public WatchRun {
protected:
    /// @return whether it was ended
    bool DieAt(int step) const {
        const DyingProgram dying(step);
        return WatchOnce().exitCode == -SIGKILL;
    }

    void Begin() const {
        for (const char* const name : {"in", "out"}) {
            std::filesystem::remove_all(m_folder / name);
            std::filesystem::create_directory(m_folder / name);
        }
        for (const char* const ending : {"", "-wal", "-shm"})
            std::filesystem::remove(m_folder / (std::string("journal.db") + ending));
        Put("a.doc", "companion=.pdf");
        Put("b.doc", "screen=-1005");
    }

    void ExpectAllDoneOnce(const std::string& when) const {
        SCOPED_TRACE(when);
        EXPECT_THAT(FilesIn("out"), ElementsAre("a.pdf", "a.ps"));
        EXPECT_THAT(FilesIn("in"),
                    ElementsAre("failed/b.doc", "failed/b.doc.txt", "processed/a.doc"));
    }
};

/// Each of them has its share of the steps, for they take a while.
class WatchCrashStepsTest : public WatchCrashTest, public testing::WithParamInterface<int> {};

constexpr int Shares = 4;

TEST_P(WatchCrashStepsTest, WhereverItDiesEachDocumentComesOutOnce) {
    Configure();
    int step = GetParam();
    for (bool died = true; died && !HasFailure(); step += Shares) {
        Begin();
        died = DieAt(step);
        EXPECT_THAT(WatchOnce().exitCode, testing::AnyOf(0, 1));
        ExpectAllDoneOnce("ended before step " + std::to_string(step));
    }
    EXPECT_GT(step, 30) << "the steps were not seen";
}

INSTANTIATE_TEST_SUITE_P(All, WatchCrashStepsTest, testing::Range(1, Shares + 1));

TEST_F(WatchCrashTest, WhatIsUnderWayOutlastsANewConfiguration) {
    Configure();
    Put("a.doc", "started=" + Path("started") + "\nwait=" + Path("go"));
    RunningProgram program(QuillonCommand(Watch()));
    AwaitFile(m_folder / "started");
    Configure("on_same_name = 'replace'\n");
    const std::string owner = ReadBytes(m_folder / "in/.quillon-watch-owner");
    const int process = std::stoi(owner.substr(owner.rfind(' ')));
    ASSERT_EQ(kill(process, SIGHUP), 0) << owner;
    Await("the new configuration",
          [&program] { return program.Err().find("read anew") != std::string::npos; });
    m_folder.Write("go", "");
    AwaitFile(m_folder / "in/processed/a.doc");
    EXPECT_THAT(FilesIn("out"), ElementsAre("a.ps"));
}

TEST_F(WatchCrashTest, AndWhereverItDiesWhenItStartsAgain) {
    Configure();
    for (const int first : {20, 25, 30, 35, 40}) {
        Begin();
        DieAt(first);
        for (int step = 1; DieAt(step) && !HasFailure(); step += 2)
            ;
        WatchOnce();
        Ask({"retry", "--failed"}); // a document that has ended it three times waits for a person
        WatchOnce();
        ExpectAllDoneOnce("ended before step " + std::to_string(first) +
                          ", and then before others");
    }
}

} // namespace
