#include "host/program/journal/Journal.h"
#include "tests/host/Program.h"

#include <gmock/gmock.h>

namespace fs = std::filesystem;
using testing::ElementsAre;

namespace {

/// What is done from outside to a journal whose service is down.
class QueueTest : public testing::Test {
protected:
    std::unique_ptr<Journal> Open() const {
        Fault fault;
        auto journal = OpenJournal(m_file, fault);
        EXPECT_TRUE(journal) << fault.Text();
        return journal;
    }

    /// Two documents that have failed, one that is waiting, and one that has come out.
    void Prepare() const {
        const std::unique_ptr<Journal> journal = Open();
        const auto document = [](std::uint64_t number, const char* folder, const char* name) {
            return NewJob{folder, fs::path("/in") / name, "", {1, number, 1, 1}, 50};
        };
        journal->Insert({document(1, "letters", "a.doc"), document(2, "letters", "b.doc"),
                         document(3, "bills", "c.doc"), document(4, "bills", "d.doc")});
        for (const JobState state : {JobState::Failed, JobState::Failed, JobState::Archived}) {
            Job job = journal->Claim({{"letters"}, {"bills"}}, {"test"}).value_or(Job());
            job.state = state;
            job.open = false;
            job.ended = std::chrono::system_clock::now();
            job.text = "Failed";
            if (state == JobState::Failed)
                job.fault = Fault{"it is empty", Blame::Document, -7};
            EXPECT_TRUE(journal->Commit(job));
        }
    }

    RunResult Run(std::vector<std::string> arguments) const {
        arguments.insert(arguments.end(), {"--lang", "en", "--journal", m_file});
        return RunQuillon(std::move(arguments));
    }

    TemporaryFolder m_folder;
    const std::string m_file = (m_folder / "journal.db").u8string();
};

TEST_F(QueueTest, ShowsAndDoesWhatIsAsked) {
    Prepare();
    const struct {
        std::vector<std::string> arguments;
        int exitCode;
        std::string says; ///< on stdout if it went well, and otherwise on stderr
    } steps[] = {
        {{"queue"}, 0, "letters/a.doc: failed, 1 attempt, -7 Failed (it is empty)"},
        {{"queue"}, 0, "bills: 1 waiting, 1 failed"},
        {{"queue", "--folder", "bills"}, 0, "bills: 1 waiting, 1 failed"},
        {{"queue", "--folder", "mails"}, 3, "bills, letters"},
        {{"queue", "--state", "lost"}, 3, "no state lost"},
        {{"pause"}, 0, "All folders are paused"},
        {{"queue"}, 0, "1 failed, paused"},
        {{"pause", "bills"}, 0, "bills is paused"},
        {{"resume"}, 0, "Still paused: bills"},
        {{"resume", "mails"}, 3, "mails"},
        {{"retry"}, 3, "--failed"},
        {{"retry", "2"}, 1, ""},
        {{"retry", "--failed", "--folder", "bills"}, 0, "3: it is tried again"},
        {{"retry", "1", "3"}, 1, ""},
        {{"queue"}, 0, "bills: 2 waiting, paused"},
    };
    for (const auto& step : steps) {
        const RunResult run = Run(step.arguments);
        EXPECT_EQ(run.exitCode, step.exitCode) << testing::PrintToString(step.arguments);
        EXPECT_THAT(run.exitCode == 0 ? run.out : run.err, HasSubstr(step.says));
    }
    EXPECT_THAT(Open()->Paused(), ElementsAre("bills"));
}

TEST_F(QueueTest, HasRecords) {
    Prepare();
    const RunResult run = Run({"queue", "--json", "--state", "failed", "--limit", "1"});
    ASSERT_EQ(run.Records("job").size(), 1U);
    const nlohmann::json job = run.Records("job")[0];
    EXPECT_EQ(job["folder"], "bills"); // the newest
    EXPECT_EQ(job["state"], "failed");
    EXPECT_EQ(job["fault"], "document");
    const std::string ended = job["ended"];
    EXPECT_EQ(ended.size(), std::string("2026-11-25T20:14:03Z").size()) << ended;
    EXPECT_EQ(ended.substr(10, 1) + ended.back(), "TZ") << ended;
    ASSERT_EQ(run.Records("queue").size(), 2U);
    EXPECT_EQ(run.Records("queue")[1]["failed"], 1);
}

TEST_F(QueueTest, LeavesAloneWhatIsNoJournal) {
    const RunResult empty = Run({"queue"});
    EXPECT_EQ(empty.exitCode, 0);
    EXPECT_THAT(empty.out, HasSubstr("empty"));
    EXPECT_EQ(Run({"pause"}).exitCode, 3);
    EXPECT_TRUE(fs::is_empty(m_folder.Path()));
    m_folder.Write("journal.db", "Dear Sir or Madam");
    EXPECT_EQ(Run({"queue"}).exitCode, 2);
    EXPECT_EQ(ReadBytes(m_file), "Dear Sir or Madam");
}

TEST_F(QueueTest, FindsTheJournalOfAConfiguration) {
    Prepare();
    fs::create_directory(m_folder / "in");
    fs::create_directory(m_folder / "out");
    const std::string file = m_folder
                                 .Write("watch.toml", "journal = \"journal.db\"\n[[folder]]\n"
                                                      "name = \"mails\"\nin = \"in\"\n"
                                                      "out = \"out\"\n")
                                 .u8string();
    const RunResult run = RunQuillon({"queue", "--config", file, "--lang", "en"});
    EXPECT_THAT(run.out, HasSubstr("mails: nothing yet"));
    EXPECT_THAT(run.out, HasSubstr("a.doc"));
    EXPECT_EQ(RunQuillon({"queue", "--config", file + "x"}).exitCode, 3);
}

} // namespace
