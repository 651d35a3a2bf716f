#include "host/program/journal/PostgresJournal.h"

#include "tests/support/linux/PostgresServer.h"

#include <gmock/gmock.h>

#include <atomic>
#include <thread>

using namespace std::chrono_literals;
namespace fs = std::filesystem;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;
using testing::Not;

namespace {

const Claimant Us = {"us", 30s};
const Claimant Them = {"them", 30s};
const std::vector<ClaimableFolder> Both = {{"letters"}, {"bills", true}};

NewJob Document(const fs::path& source, const char* folder = "letters") {
    return {folder, source, "", {1, fs::hash_value(source), 3, 4}, 50, "ab12"};
}

/// What a journal does that machines share.
class PostgresJournalTest : public testing::Test {
protected:
    void SetUp() override {
        if (const std::string obstacle = PostgresServer::Obstacle(); !obstacle.empty())
            GTEST_SKIP() << obstacle;
        m_schema = testing::UnitTest::GetInstance()->current_test_info()->name();
    }

    static PostgresServer& Server() { return PostgresServer::OfAllTests(); }

    std::unique_ptr<PostgresJournal> Open(const std::map<std::string, fs::path>& shares = {},
                                          const std::string& user = "postgres") {
        PostgresJournal::Options options;
        options.map = PathMap(shares);
        auto journal = PostgresJournal::Open(Server().Url(m_schema, user), options, m_fault);
        EXPECT_TRUE(journal) << m_fault.Text();
        return journal;
    }

    std::string m_schema;
    Fault m_fault;
};

/// Waits for what comes by itself.
template <typename Condition>
void Await(Condition condition) {
    while (!condition())
        std::this_thread::yield();
}

TEST_F(PostgresJournalTest, GoesOnWhenTheServerComesBack) {
    PostgresServer& server = Server();
    const auto journal = Open();
    journal->Insert({Document("/in/a"), Document("/in/b")});
    Job job = journal->Claim(Both, Us).value();
    job.state = JobState::Delivering;
    const JournalTime before = journal->Now();
    server.Kill();
    EXPECT_THROW(journal->Commit(job), JournalError);
    EXPECT_THROW(journal->Commit(job), JournalError);
    EXPECT_THROW(journal->Claim(Both, Us), JournalError);
    EXPECT_GE(journal->Now(), before);
    server.Start();
    Await([&] {
        try {
            return journal->Commit(job);
        } catch (const JournalError&) {
            return false;
        }
    });
    EXPECT_TRUE(journal->Commit(job)) << "that it is stored need not have been heard";
    EXPECT_EQ(journal->List({}).size(), 2U);
    EXPECT_TRUE(journal->Claim(Both, Us));
    server.Run("SELECT pg_terminate_backend(pid) FROM pg_stat_activity "
               "WHERE application_name='quillon'");
    EXPECT_THROW(journal->List({}), JournalError);
    EXPECT_EQ(journal->List({}).size(), 2U);
}

TEST_F(PostgresJournalTest, LeavesAJobToItsClaimantForTheLease) {
    const auto ours = Open();
    const auto theirs = Open();
    ours->Insert({Document("/in/a")});
    Job job = ours->Claim(Both, Us).value();
    EXPECT_THAT(theirs->TakeOver({"letters"}, Them), IsEmpty());
    ours->Heartbeat({"us", 0s}, {});
    ours->Heartbeat({"them", 0s}, {job.id});
    EXPECT_THAT(theirs->TakeOver({"letters"}, Them), IsEmpty());
    ours->Heartbeat({"us", 0s}, {job.id}); // it runs out at once
    EXPECT_EQ(theirs->TakeOver({"letters"}, Them).size(), 1U);
    EXPECT_FALSE(ours->Commit(job));
    ours->Heartbeat({"us", 0s}, {job.id});
    EXPECT_THAT(ours->TakeOver({"letters"}, Us), IsEmpty());
}

TEST_F(PostgresJournalTest, KnowsPathsAndKindsOnEveryMachine) {
    const std::string odd = "\xFF\\x41.Docx"; // no UTF-8, and what looks like our way to write that
    const auto finder = Open({{"office", "/mnt/office"}});
    const auto worker = Open({{"office", "/srv/o"}});
    finder->Insert({Document("/mnt/office/in/" + odd), Document("/mnt/office/in/b.xlsx", "bills"),
                    Document("/elsewhere/\xC3\xA4.doc")});
    const auto claim = [&](const std::set<std::string>& cannot) {
        return worker->Claim(Both, {"them", 30s, cannot}).value_or(Job());
    };
    EXPECT_EQ(claim({"docx", "doc"}).source, "/srv/o/in/b.xlsx");
    EXPECT_EQ(claim({"docx", "doc"}).source, "");
    EXPECT_EQ(claim({"docx"}).source, fs::u8path("/elsewhere/\xC3\xA4.doc"));
    Job job = claim({"doc"});
    EXPECT_EQ(job.source, "/srv/o/in/" + odd);
    EXPECT_EQ(job.digest, "ab12");
    job.output = "/srv/o/out/" + odd;
    job.fault = Fault{wxString(wxUniChar(0xD800)), Blame::Document}; // is no character
    EXPECT_TRUE(worker->Commit(job));
    EXPECT_EQ(finder->List({{}, {}, {}, {}, false, 9})[0].output, "/mnt/office/out/" + odd);
    Server().Run("DO $$ BEGIN ASSERT EXISTS (SELECT FROM \"" + m_schema +
                 "\".job WHERE output = 'office:/out/\\xff\\\\x41.Docx'); END $$");
}

TEST_F(PostgresJournalTest, GivesEachDocumentOnce) {
    constexpr int Count = 500;
    std::atomic<std::size_t> entered{0};
    std::atomic<std::size_t> claimed{0};
    std::vector<std::thread> threads;
    const auto join = [&threads] {
        for (std::thread& thread : threads)
            thread.join();
        threads.clear();
    };
    threads.reserve(4);
    for (int finder = 0; finder < 2; ++finder)
        threads.emplace_back([&, journal = std::shared_ptr<Journal>(Open())] {
            for (int number = 0; number < Count; number += 10) {
                std::vector<NewJob> found;
                for (int each = number; each < number + 10; ++each)
                    found.push_back(Document("/in/" + std::to_string(each),
                                             each % 2 == 0 ? "letters" : "bills"));
                entered += journal->Insert(found);
            }
        });
    join(); // what is done with may come again
    for (int worker = 0; worker < 4; ++worker)
        threads.emplace_back([&, journal = std::shared_ptr<Journal>(Open())] {
            while (claimed < Count)
                if (auto job = journal->Claim(Both, Us)) {
                    ++claimed;
                    job->state = JobState::Archived;
                    job->open = false;
                    EXPECT_TRUE(journal->Commit(*job));
                    EXPECT_EQ(job->attempts, 1);
                } else {
                    std::this_thread::yield();
                }
        });
    join();
    EXPECT_EQ(entered, static_cast<std::size_t>(Count));
    EXPECT_EQ(claimed, static_cast<std::size_t>(Count));
    const auto journal = Open();
    journal->Heartbeat(Us, {}); // adds the counts up
    EXPECT_THAT(journal->Counts()["letters"].jobs,
                ElementsAre(std::pair(JobState::Archived, Count / 2U)));
}

TEST_F(PostgresJournalTest, SaysWhyItCannotBeOpened) {
    Server().Run("CREATE ROLE guest LOGIN; CREATE ROLE strict LOGIN PASSWORD 'open'");
    const std::string url = Server().Url(m_schema);
    const std::string unknown = "postgres://guest@/nothing?host=" + url.substr(url.find('=') + 1);
    const struct {
        std::string url;
        JournalNeed need;
        const char* reason;
        Blame blame;
    } cases[] = {
        {"postgres://x:hush@/x?host=/nowhere", JournalNeed::Make, "reached", Blame::Machine},
        {"postgres://x:hush@[/x", JournalNeed::Make, "cannot be read", Blame::Usage},
        {unknown, JournalNeed::Make, "\"nothing\" does not exist", Blame::Usage},
        {Server().Url(m_schema, "strict:hush"), JournalNeed::Make, "password", Blame::Usage},
        {Server().Url(m_schema, "guest"), JournalNeed::Make, "may not make", Blame::Usage},
        {url, JournalNeed::Visit, "has no queue", Blame::Usage},
    };
    for (const auto& each : cases) {
        EXPECT_FALSE(OpenJournal(each.url, m_fault, each.need)) << each.reason;
        EXPECT_THAT(m_fault.Text().utf8_string(), HasSubstr(each.reason));
        EXPECT_THAT(m_fault.Text().utf8_string(), Not(HasSubstr("hush")));
        EXPECT_EQ(m_fault.blame, each.blame) << m_fault.Text();
    }
    const auto owners = Open();
    Server().Run("GRANT USAGE ON SCHEMA \"" + m_schema + "\" TO guest; GRANT SELECT, INSERT, " +
                 "UPDATE, DELETE ON ALL TABLES IN SCHEMA \"" + m_schema + "\" TO guest");
    const auto guests = Open({}, "guest");
    EXPECT_EQ(guests->Insert({Document("/in/a")}), 1U);
    const Job job = guests->Claim(Both, Us).value();
    guests->Heartbeat(Us, {job.id});
    guests->Shared()->Report({}, Us);
    guests->Remove(job.id);
    Server().Run("UPDATE \"" + m_schema + "\".quillon_schema SET version=1000");
    EXPECT_FALSE(OpenJournal(url, m_fault));
    EXPECT_THAT(m_fault.Text().utf8_string(), HasSubstr("later version"));
}

TEST_F(PostgresJournalTest, CarriesWordFromOneToAnother) {
    const auto finder = Open();
    const auto worker = Open();
    EXPECT_FALSE(worker->Claim(Both, Them));
    finder->Insert({Document("/in/a")});
    Await([&] { return worker->Claim(Both, Them).has_value(); }); // long before its memory fades
    EXPECT_THAT(finder->Paused(), IsEmpty());
    worker->SetPaused("bills", true);
    Await([&] { return finder->Paused().count("bills") == 1; });

    finder->Shared()->Announce({{"letters", "{}", "<a/>"}, {"bills", "{}", ""}}, "us",
                               {"letters", "bills"});
    const AnnouncedFolder letters = {"letters", R"({"in": "office:/in"})", "<b/>"};
    finder->Shared()->Announce({letters}, "us", {"letters", "bills"});
    finder->Shared()->Announce({}, "them", {"others"}); // it has told of none of these
    EXPECT_THAT(worker->Shared()->Announced(),
                ElementsAre(AnnouncedFolder{"bills", "{}", ""}, letters));

    Machine machine;
    machine.name = "gone";
    finder->Shared()->Report(machine, {"gone", 0s});
    machine = {"us", true, 4, {"1.0", "7.4", "10", "f00d"}, true, {"doc"}, 3, "no space", {}, {}};
    finder->Shared()->Report(machine, Us);
    const std::vector<Machine> machines = worker->Shared()->Machines();
    ASSERT_EQ(machines.size(), 2U);
    EXPECT_EQ(machines[1].name, "gone");
    EXPECT_FALSE(machines[1].isAlive);
    const Machine& told = machines[0];
    EXPECT_TRUE(told.finds && told.takesAnyVersion && told.isAlive);
    EXPECT_EQ(
        std::tie(told.name, told.jobs, told.cannot, told.running, told.obstacle),
        std::tie(machine.name, machine.jobs, machine.cannot, machine.running, machine.obstacle));
    EXPECT_EQ(told.makers, machine.makers);
    EXPECT_EQ(told.started, told.seen);
    Server().Run("UPDATE \"" + m_schema + "\".machine SET seen = now() - interval '2 days' " +
                 "WHERE name='gone'");
    finder->Shared()->Report(machine, Us);
    EXPECT_EQ(worker->Shared()->Machines().size(), 1U);
    finder->Shared()->TakeLeave("us");
    EXPECT_THAT(worker->Shared()->Machines(), IsEmpty());
}

} // namespace
