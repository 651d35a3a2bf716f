#include "host/program/journal/SqliteJournal.h"
#include "tests/host/JournalImplementation.h"
#include "tests/host/System.h"
#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>
#include <sqlite3.h>

#include <functional>

using namespace std::chrono_literals;
namespace fs = std::filesystem;
using testing::ElementsAre;
using testing::HasSubstr;
using testing::IsEmpty;

namespace {

SqliteJournal::Options OptionsFor(const JournalTime& now) {
    SqliteJournal::Options options;
    options.patience = 0ms;
    options.now = [&now] { return now; };
    return options;
}

std::unique_ptr<Journal> OpenSqlite(const fs::path& folder, const JournalTime& now) {
    Fault fault;
    std::unique_ptr<Journal> journal =
        SqliteJournal::Open(folder / "new" / "journal.db", OptionsFor(now), fault);
    EXPECT_TRUE(journal) << fault.Text();
    return journal;
}

NewJob Document(const char* folder, const std::string& name, int priority = 50) {
    const std::uint64_t number = std::hash<std::string>()(folder + name);
    return {folder, fs::path("/in") / name, "", {~0ULL, number, 1, 2}, priority};
}

std::string NameOf(const Job& job) {
    return job.source.filename().u8string();
}

const Claimant Us = {"us", 30s};
const std::vector<ClaimableFolder> Both = {{"letters"}, {"bills"}};

/// What every journal does, whatever keeps it.
class JournalTest : public testing::TestWithParam<JournalImplementation> {
protected:
    void SetUp() override {
        if (const std::string obstacle = GetParam().obstacle(); !obstacle.empty())
            GTEST_SKIP() << obstacle;
        m_journal = Open();
        ASSERT_TRUE(m_journal);
    }

    std::unique_ptr<Journal> Open() const { return GetParam().open(m_folder.Path(), m_now); }

    Job Claim() const { return m_journal->Claim(Both, Us).value_or(Job()); }
    bool HasNone() const { return !m_journal->Claim(Both, Us); }

    /// Claims all there is.
    std::string ClaimAll(const std::vector<ClaimableFolder>& folders = Both,
                         std::chrono::seconds each = 0s) {
        std::string names;
        for (; const auto job = m_journal->Claim(folders, Us); m_now += each)
            names.append(names.empty() ? "" : " ").append(NameOf(*job));
        return names;
    }

    void Fail(Job job) const {
        job.state = JobState::Failed;
        job.open = false;
        job.ended = m_now;
        EXPECT_TRUE(m_journal->Commit(job));
    }

    TemporaryFolder m_folder;
    JournalTime m_now{std::chrono::hours(500'000)};
    std::unique_ptr<Journal> m_journal;
};

TEST_P(JournalTest, BeginsInOrder) {
    const auto minor = [](const std::string& name) { return Document("bills", name, 48); };
    const struct {
        std::vector<NewJob> found;
        std::vector<ClaimableFolder> folders;
        std::string begun;
    } cases[] = {
        {{Document("letters", "b"), Document("letters", "a")}, {{"letters"}}, "b a"},
        {{Document("letters", "b"), Document("letters", "a")}, {{"letters", true}}, "a b"},
        {{Document("letters", "1"), Document("letters", "2"), Document("letters", "3"),
          Document("bills", "x"), Document("bills", "y")},
         Both,
         "x 1 y 2 3"},
        {{Document("letters", "1"), Document("letters", "2"), minor("x")}, Both, "1 2 x"},
        // Two minutes are worth two in priority.
        {{Document("letters", "1"), Document("letters", "2"), Document("letters", "3"),
          Document("letters", "4"), Document("letters", "5"), minor("x"), minor("y")},
         Both,
         "1 2 3 x 4 5 y"},
        {{minor("x"), Document("others", "1")}, Both, "x"},
    };
    for (const auto& each : cases) {
        EXPECT_EQ(m_journal->Insert(each.found), each.found.size());
        EXPECT_EQ(ClaimAll(each.folders, 40s), each.begun);
        for (const Job& job : m_journal->List({}))
            m_journal->Remove(job.id);
        m_now += 1h;
    }
    EXPECT_THAT(m_journal->Counts(), IsEmpty());
}

TEST_P(JournalTest, LeavesAloneWhatIsNotDueOrPaused) {
    m_journal->Insert({Document("letters", "a")});
    for (const wxString& folder : {wxString("letters"), wxString()}) {
        m_journal->SetPaused(folder, true);
        EXPECT_THAT(m_journal->Paused(), ElementsAre(folder));
        EXPECT_TRUE(HasNone());
        m_journal->SetPaused(folder, false);
    }
    for (const auto later : {std::chrono::seconds(30s), std::chrono::seconds(-1h)}) {
        Job job = Claim();
        job.state = JobState::Waiting;
        job.due = m_now + 30s;
        EXPECT_TRUE(m_journal->Commit(job));
        EXPECT_TRUE(HasNone());
        m_now += later; // or the clock is set back: then it must not wait for an hour more
        EXPECT_EQ(m_journal->Counts()["letters"].jobs[JobState::Waiting], 1U);
    }
    EXPECT_EQ(Claim().attempts, 3);
}

TEST_P(JournalTest, HasAFileOnce) {
    const NewJob document = Document("letters", "a");
    EXPECT_EQ(m_journal->Insert({document, document, Document("letters", "b")}), 2U);
    EXPECT_EQ(m_journal->Insert({document}), 0U);
    Job job = Claim();
    job.state = JobState::Archived;
    job.open = false;
    EXPECT_TRUE(m_journal->Commit(job));
    EXPECT_EQ(m_journal->Insert({document}), 1U);
}

TEST_P(JournalTest, ObeysWhoClaimedLast) {
    m_journal->Insert({Document("letters", "a"), Document("letters", "b")});
    Job job = Claim();
    const std::unique_ptr<Journal> other = Open();
    m_now += 31s; // the lease has run out
    const std::vector<Job> taken = other->TakeOver({"letters"}, {"them"});
    ASSERT_EQ(taken.size(), 1U);
    EXPECT_EQ(taken[0].claimedBy, "them");
    job.state = JobState::Delivering;
    EXPECT_FALSE(m_journal->Commit(job));
    Job theirs = taken[0];
    theirs.state = JobState::Finished;
    EXPECT_TRUE(other->Commit(theirs));
    m_now += 31s;
    EXPECT_EQ(m_journal->TakeOver({"letters"}, Us)[0].state, JobState::Finished);
    EXPECT_FALSE(other->Commit(theirs));
    EXPECT_THAT(m_journal->TakeOver({"bills"}, Us), IsEmpty());
    m_journal->Heartbeat(Us, {job.id});
    other->Remove(job.id);
    EXPECT_FALSE(m_journal->Commit(job));
}

TEST_P(JournalTest, TriesAgainWhatHasFailed) {
    const NewJob document = Document("letters", "a");
    m_journal->Insert({document});
    const Job job = Claim();
    EXPECT_FALSE(m_journal->Retry(job.id));
    Fail(job);
    m_now += 1min;
    EXPECT_TRUE(m_journal->Retry(job.id));
    const Job again = Claim();
    EXPECT_EQ(again.attempts, 1);
    EXPECT_EQ(again.inserted, m_now);
    Fail(again);
    m_journal->Insert({document}); // somebody has put the file back
    EXPECT_FALSE(m_journal->Retry(job.id));
    EXPECT_FALSE(m_journal->Retry(job.id + 100));
}

TEST_P(JournalTest, KeepsAllThereIsOfAJob) {
    m_journal->Insert({Document("letters", "a", 7), Document("letters", "b")});
    Job job = Claim();
    job.source = fs::u8path("/in/failed/\xC3\xA4");
    job.state = JobState::Failed;
    job.open = false;
    job.deaths = 2;
    job.ended = m_now + 5s;
    job.seconds = 1.5;
    job.workplace = "/out/.quillon-1-1";
    job.product = wxString::FromUTF8("\xC3\xA4.ps");
    job.output = "/out/a.ps";
    job.fault = Fault{"it is empty", Blame::Outside, -7, "fill it"};
    job.text = "Failed";
    EXPECT_TRUE(m_journal->Commit(job));
    m_journal = Open();
    JobQuery query;
    query.state = JobState::Failed;
    const std::vector<Job> kept = m_journal->List(query);
    ASSERT_EQ(kept.size(), 1U);
    const auto all = [](const Job& each) {
        return std::tuple(each.id, each.folder, each.source, each.inside, each.priority,
                          each.attempts, each.deaths, each.inserted, each.due, each.begun,
                          each.ended, each.seconds, each.workplace, each.product, each.output,
                          each.text, each.claimedBy, each.token, each.open);
    };
    EXPECT_EQ(all(kept[0]), all(job));
    EXPECT_EQ(kept[0].identity, job.identity);
    ASSERT_TRUE(kept[0].fault);
    EXPECT_EQ(kept[0].fault->Text(), job.fault->Text());
    EXPECT_EQ(kept[0].fault->blame, Blame::Outside);
    EXPECT_EQ(kept[0].fault->code, -7);
}

TEST_P(JournalTest, ListsWhatIsAskedFor) {
    m_journal->Insert({Document("letters", "1"), Document("letters", "2"), Document("letters", "3"),
                       Document("bills", "x", 60)});
    const auto names = [this](const JobQuery& query) {
        std::string all;
        for (const Job& job : m_journal->List(query))
            all += NameOf(job);
        return all;
    };
    EXPECT_EQ(names({}), "x123");
    EXPECT_EQ(names({"letters", JobState::Waiting, true, {}, false, 2}), "12");
    Claim();
    for (int count = 0; count < 2; ++count, m_now += 1s)
        Fail(Claim());
    EXPECT_EQ(names({{}, JobState::Failed, {}, {}, true, 9}), "21");
    EXPECT_EQ(names({{}, JobState::Failed, {}, m_now - 1s, false, 9}), "1");
    EXPECT_EQ(names({{}, {}, true, {}, false, 9}), "x3");
    const FolderCounts counts = m_journal->Counts()["letters"];
    EXPECT_THAT(counts.jobs,
                ElementsAre(std::pair(JobState::Waiting, 1U), std::pair(JobState::Failed, 2U)));
    EXPECT_EQ(counts.oldestWaiting, m_now - 2s);
}

std::vector<JournalImplementation> Implementations() {
    std::vector<JournalImplementation> all = SharedImplementations();
    all.push_back({"sqlite", OpenSqlite, [] { return std::string(); }});
    return all;
}

INSTANTIATE_TEST_SUITE_P(Each, JournalTest, testing::ValuesIn(Implementations()),
                         [](const auto& each) { return std::string(each.param.name); });

/// A journal in a file, to which things happen.
class JournalFileTest : public testing::Test {
protected:
    std::unique_ptr<Journal> Open(JournalNeed need = JournalNeed::Make) {
        SqliteJournal::Options options = OptionsFor(m_now);
        options.need = need;
        return SqliteJournal::Open(m_file, std::move(options), m_fault);
    }

    void Run(const char* sql) const { SqliteDatabase(m_file, true, 0ms).Run(sql); }

    std::size_t FilesSetAside() const {
        std::size_t count = 0;
        for (const auto& entry : fs::directory_iterator(m_folder.Path()))
            count += entry.path().u8string().find(".damaged-") != std::string::npos ? 1 : 0;
        return count;
    }

    TemporaryFolder m_folder;
    const fs::path m_file = m_folder / "journal.db";
    JournalTime m_now{std::chrono::hours(500'000)};
    Fault m_fault;
};

TEST_F(JournalFileTest, IsBegunAnewWhenItIsDamaged) {
    const std::pair<const char*, std::function<void()>> damages[] = {
        {"no database", [this] { m_folder.Write("journal.db", "Dear Sir or Madam"); }},
        {"truncated", [this] { fs::resize_file(m_file, 9000); }},
        {"overwritten",
         [this] {
             std::string bytes = ReadBytes(m_file);
             bytes.replace(4096, 8192, 8192, 'x');
             m_folder.Write("journal.db", bytes);
         }},
    };
    for (const auto& [what, damage] : damages) {
        Open()->Insert({Document("letters", "a")});
        damage();
        if (const std::unique_ptr<Journal> visited = Open(JournalNeed::Visit)) {
            EXPECT_THROW(visited->List({}), JournalError) << what;
        }
        EXPECT_EQ(FilesSetAside(), 0U) << what;
        std::unique_ptr<Journal> journal = Open();
        ASSERT_TRUE(journal) << what << m_fault.Text();
        EXPECT_THAT(journal->List({}), IsEmpty()) << what;
        EXPECT_EQ(FilesSetAside(), 1U) << what;
        journal.reset();
        for (const auto& entry : fs::directory_iterator(m_folder.Path()))
            fs::remove(entry.path());
    }
}

TEST_F(JournalFileTest, IsRefusedWhenItIsAnothers) {
    EXPECT_FALSE(Open(JournalNeed::Visit));
    EXPECT_FALSE(fs::exists(m_file));
    ASSERT_TRUE(Open());
    const struct {
        const char* sql;
        const char* reason;
        Blame blame;
    } cases[] = {
        {"PRAGMA user_version=2", "later version", Blame::Usage},
        {"PRAGMA application_id=1", "no journal", Blame::Usage},
    };
    for (const auto& each : cases) {
        Run(each.sql);
        EXPECT_FALSE(Open());
        EXPECT_THAT(m_fault.Text().utf8_string(), HasSubstr(each.reason));
        EXPECT_EQ(m_fault.blame, each.blame);
    }
    SqliteDatabase locked(m_file, false, 0ms);
    locked.Run("PRAGMA locking_mode=EXCLUSIVE; BEGIN IMMEDIATE; PRAGMA application_id=2; COMMIT");
    EXPECT_FALSE(Open());
    EXPECT_THAT(m_fault.Text().utf8_string(), HasSubstr("locked"));
    EXPECT_EQ(m_fault.blame, Blame::Machine);
    EXPECT_EQ(FilesSetAside(), 0U);
}

TEST_F(JournalFileTest, IsMadeAnewWhenItGoesWhileItIsOpen) {
    if (!System::RemovesOpenFiles)
        GTEST_SKIP() << "the system keeps it";
    const std::function<void()> happenings[] = {
        [this] {
            for (const char* const ending : {"", "-wal", "-shm"})
                fs::remove(m_file.u8string() + ending);
        },
        [this] { fs::remove(m_file); },
        [this] { fs::resize_file(m_file, 0); },
    };
    for (const auto& happening : happenings) {
        const std::unique_ptr<Journal> journal = Open();
        const std::unique_ptr<Journal> other = Open();
        ASSERT_TRUE(journal && other) << m_fault.Text();
        journal->Insert({Document("letters", "a")});
        EXPECT_EQ(other->List({}).size(), 1U);
        happening();
        const std::size_t number = static_cast<std::size_t>(&happening - happenings);
        for (Journal* const each : {journal.get(), other.get()}) {
            EXPECT_THROW(each->List({}), JournalError) << number;
            EXPECT_THAT(each->List({}), IsEmpty()) << number;
        }
        EXPECT_EQ(other->Insert({Document("letters", "a")}), 1U) << number;
        EXPECT_EQ(journal->List({}).size(), 1U) << number;
        fs::remove_all(m_folder.Path());
        fs::create_directory(m_folder.Path());
    }
}

} // namespace
