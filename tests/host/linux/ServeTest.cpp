// Machines that share a queue on a PostgreSQL server: processes on this one, with a server of the
// test's own.

#include "tests/host/WatchRun.h"
#include "tests/host/linux/DyingProgram.h"
#include "tests/support/linux/PostgresServer.h"

#include <csignal>
#include <pqxx/pqxx>

namespace fs = std::filesystem;
using testing::ElementsAre;
using testing::SizeIs;

namespace {

class ServeTest : public WatchRun {
protected:
    using Program = std::unique_ptr<RunningProgram>;

    void SetUp() override {
        const std::string obstacle = PostgresServer::Obstacle();
        if (!obstacle.empty())
            GTEST_SKIP() << obstacle;
        static int s_tests = 0;
        m_url = Server().Url("serve" + std::to_string(++s_tests));
        fs::create_directory_symlink(m_folder.Path(), m_folder / "elsewhere");
        ConfigureQueue();
    }

    /// @param more lines for the head
    void ConfigureQueue(const std::string& more = {}) const {
        m_folder.Write("watch.toml",
                       "queue = '" + m_url + "'\nlease = '3s'\nhttp = ''\n" + more +
                           "\n[map]\nshare = '.'\n"
                           "[defaults]\nsettle = '20ms'\nretries = ['1s']\nmin_free = '1K'\n"
                           "[[folder]]\nname = 'letters'\nin = 'in'\nout = 'out'\n");
    }

    static Program Start(const Arguments& arguments) {
        return std::make_unique<RunningProgram>(QuillonCommand(arguments));
    }

    Program StartFinder() const {
        Program finder = Start(Watch());
        AwaitFile(m_folder / "in/failed"); // the last one of what it makes
        return finder;
    }

    /// @param share where it has what the finder has in the test's folder
    Arguments Serve(const std::string& share = "elsewhere", const Arguments& more = {}) const {
        Arguments arguments = {
            "serve", "--config", Path("watch.toml"), "--map", "share=" + Path(share), "--json"};
        arguments.insert(arguments.end(), more.begin(), more.end());
        return arguments;
    }

    std::vector<nlohmann::json> AskQueue(Arguments arguments, const std::string& type) const {
        arguments.insert(arguments.end(), {"--queue", m_url, "--json"});
        return RunQuillon(std::move(arguments)).Records(type);
    }

    /// The process that has the document which is under way.
    pid_t AwaitWorker() const {
        std::string machine;
        Await("a document under way", [&] {
            const auto rows = Rows("SELECT claimed_by FROM job WHERE state='converting'");
            machine = rows.empty() ? "" : rows[0][0].as<std::string>();
            return !machine.empty();
        });
        return std::stoi(machine.substr(machine.rfind(':') + 1));
    }

    void Run(const std::string& sql) const {
        pqxx::connection connection(m_url);
        pqxx::work work(connection);
        work.exec(sql);
        work.commit();
    }

    pqxx::result Rows(const std::string& sql) const {
        pqxx::connection connection(m_url);
        return pqxx::work(connection).exec(sql);
    }

    /// Has nobody wait for what a machine has that is dead.
    void EndLeases() const { Run("UPDATE job SET lease_until = now() - interval '1 second'"); }

    void AwaitOutputs(std::size_t count) const {
        Await("the outputs", [&] {
            std::size_t there = 0;
            for (const auto& entry : fs::directory_iterator(m_folder / "out"))
                there += entry.path().extension() == ".ps" ? 1 : 0;
            return there >= count;
        });
    }

    bool HasOpenJobs(std::size_t atLeast = 1) const {
        return Rows("SELECT 1 FROM job WHERE open").size() >= atLeast;
    }

    static PostgresServer& Server() { return PostgresServer::OfAllTests(); }

    std::string m_url;
};

TEST_F(ServeTest, MachinesWithOtherPathsConvertWhatOneFinds) {
    constexpr int Documents = 40;
    const Program finder = StartFinder();
    const Program workers[] = {Start(Serve("elsewhere", {"-j", "2"})),
                               Start(Serve(".", {"-j", "2"}))};
    for (int number = 0; number < Documents; ++number)
        Put(std::to_string(number) + ".doc", "wait=" + Path("go"));
    Put("refused.doc", "screen=-1005");
    Await("work for both", [this] {
        return Rows("SELECT DISTINCT claimed_by FROM job WHERE state='converting'").size() == 2;
    });
    m_folder.Write("go", "");
    AwaitOutputs(Documents);
    Await("an end of all", [this] { return !HasOpenJobs(); });
    EXPECT_THAT(FilesIn("out"), SizeIs(Documents));
    EXPECT_THAT(FilesIn("in/failed"), ElementsAre("refused.doc", "refused.doc.txt"));
    EXPECT_THAT(FilesIn("in/processed"), SizeIs(Documents));
    std::set<std::string> machines;
    for (const auto& job : AskQueue({"queue", "--state", "archived"}, "job")) {
        machines.insert(job["machine"].get<std::string>());
        EXPECT_EQ(job["attempts"], 1);
    }
    EXPECT_THAT(machines, SizeIs(2));
    EXPECT_THAT(AskQueue({"queue"}, "machine"), SizeIs(3));
    for (const Program& worker : workers) {
        worker->Interrupt();
        EXPECT_EQ(worker->Wait().exitCode, 0);
    }
    EXPECT_THAT(AskQueue({"queue"}, "machine"), SizeIs(1));
    const RunResult other = RunQuillon(Watch());
    EXPECT_EQ(other.exitCode, 3);
    EXPECT_THAT(other.err, HasSubstr("is watched already"));
}

/// Each has its share of the steps, for they take a while.
class ServeCrashTest : public ServeTest, public testing::WithParamInterface<int> {
protected:
    /// @return whether it was ended before all was done
    bool DieAt(int step) const {
        const DyingProgram dying(step);
        const Program worker = Start(Serve("elsewhere", {"-j", "1"}));
        Await("an end", [&] { return worker->HasEnded() || !HasOpenJobs(); });
        worker->Interrupt();
        return worker->Wait().exitCode == -SIGKILL;
    }
};

constexpr int Shares = 4;

TEST_P(ServeCrashTest, WhereverOneDiesAnotherGoesOn) {
    const Program finder = StartFinder();
    int step = GetParam();
    for (bool died = true; died && !HasFailure(); step += Shares) {
        for (const char* const name : {"in/processed", "in/failed", "out"})
            for (const auto& entry : fs::directory_iterator(m_folder / name))
                fs::remove_all(entry.path());
        Put("a.doc", "companion=.pdf");
        Put("b.doc", "screen=-1005");
        Await("the documents", [this] { return HasOpenJobs(2); });
        died = DieAt(step);
        EndLeases();
        const Program other = Start(Serve("."));
        Await("an end of all", [this] { return !HasOpenJobs(); });
        SCOPED_TRACE("ended before step " + std::to_string(step));
        EXPECT_THAT(FilesIn("in"),
                    ElementsAre("failed/b.doc", "failed/b.doc.txt", "processed/a.doc"));
        other->Interrupt();
        other->Wait();
        EXPECT_THAT(FilesIn("out"), ElementsAre("a.pdf", "a.ps"));
    }
    EXPECT_GT(step, 15) << "the steps were not seen";
}

INSTANTIATE_TEST_SUITE_P(All, ServeCrashTest, testing::Range(1, Shares + 1));

TEST_F(ServeTest, OneThatWasStoppedForTooLongLetsGo) {
    const Program finder = StartFinder();
    const Program first = Start(Serve("elsewhere", {"-j", "1"}));
    Put("a.doc", "started=" + Path("started") + "\nwait=" + Path("go"));
    const pid_t stopped = AwaitWorker();
    ASSERT_EQ(kill(stopped, SIGSTOP), 0);
    m_folder.Write("go", ""); // its worker goes on, and makes something that nobody asks for
    const Program second = Start(Serve());
    AwaitOutputs(1); // by itself: the lease runs out
    Await("an end of all", [this] { return !HasOpenJobs(); });
    ASSERT_EQ(kill(stopped, SIGCONT), 0);
    Await("that it lets go",
          [&] { return first->Err().find("somebody else's") != std::string::npos; });
    for (const Program* const each : {&first, &second}) {
        (*each)->Interrupt();
        EXPECT_EQ((*each)->Wait().exitCode, 0);
    }
    EXPECT_THAT(FilesIn("out"), ElementsAre("a.ps"));
    EXPECT_THAT(FilesIn("in"), ElementsAre("processed/a.doc"));
    const auto jobs = AskQueue({"queue", "--state", "archived"}, "job");
    ASSERT_THAT(jobs, SizeIs(1));
    EXPECT_EQ(jobs[0]["attempts"], 2);
}

TEST_F(ServeTest, WhatIsUnderWayOutlastsTheDatabase) {
    const Program finder = StartFinder();
    const Program worker = Start(Serve("elsewhere", {"-j", "1"}));
    Put("a.doc", "started=" + Path("started") + "\nwait=" + Path("go"));
    AwaitFile(m_folder / "started");
    PostgresServer& server = Server();
    server.Kill();
    m_folder.Write("go", "");
    Put("b.doc");
    server.Start();
    AwaitOutputs(2);
    Await("an end of all", [this] { return !HasOpenJobs(); });
    EXPECT_THAT(FilesIn("out"), ElementsAre("a.ps", "b.ps"));
    EXPECT_THAT(FilesIn("in"), ElementsAre("processed/a.doc", "processed/b.doc"));
}

TEST_F(ServeTest, OneWithoutTheShareLeavesItToAnother) {
    const Program finder = StartFinder();
    const Program without = Start(Serve("elsewhere", {"-j", "1"}));
    Put("a.doc");
    AwaitOutputs(1);
    fs::remove(m_folder / "elsewhere");
    Put("b.doc");
    Await("that it says so", [this] {
        const auto machines = AskQueue({"queue"}, "machine");
        return std::any_of(machines.begin(), machines.end(), [](const auto& machine) {
            return machine["obstacle"].template get<std::string>().find("elsewhere") !=
                   std::string::npos;
        });
    });
    const Program with = Start(Serve("."));
    AwaitOutputs(2);
    Await("an end of all", [this] { return !HasOpenJobs(); });
    for (const auto& job : AskQueue({"queue", "--state", "archived"}, "job"))
        EXPECT_EQ(job["attempts"], 1);
}

TEST_F(ServeTest, OneThatWouldPrintOtherPagesDoesNotBegin) {
    const Program worker = Start(Serve());
    Await("a machine", [this] { return AskQueue({"queue"}, "machine").size() == 1; });
    Run("INSERT INTO machine SELECT 'older', replace(report::text, '\"fonts\":\"', "
        "'\"fonts\":\"other')::json, started - interval '1 hour', seen, '1 hour' FROM machine");
    const RunResult other = RunQuillon(Serve());
    EXPECT_EQ(other.exitCode, 3);
    EXPECT_THAT(other.out + other.err, HasSubstr("fonts"));
    const Program any = Start(Serve(".", {"--any-version"}));
    Await("another machine", [this] { return AskQueue({"queue"}, "machine").size() == 3; });
}

TEST_F(ServeTest, WhatCannotBeReachedFromHereWaitsAndIsTold) {
    m_folder.Write("serve.toml", "queue = '" + m_url + "'\nhttp = ''\n");
    const Program finder = StartFinder();
    Put("a.doc");
    const Program worker = Start({"serve", "--config", Path("serve.toml"), "--json"});
    Await("that it says so", [this] {
        const auto machines = AskQueue({"queue"}, "machine");
        return std::any_of(machines.begin(), machines.end(), [](const auto& machine) {
            return machine["obstacle"].template get<std::string>().find("\"share\"") !=
                   std::string::npos;
        });
    });
    EXPECT_TRUE(HasOpenJobs());
    const RunResult none = RunQuillon({"serve", "--json"});
    EXPECT_EQ(none.exitCode, 3);
}

} // namespace
