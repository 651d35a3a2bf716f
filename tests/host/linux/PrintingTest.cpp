// Documents of watched folders on a print server.

#include "tests/host/WatchRun.h"
#include "tests/host/linux/DyingProgram.h"
#include "tests/support/linux/CupsServer.h"

#include <httplib.h>

#include <csignal>
#include <cstdlib>
#include <fstream>
#include <thread>

namespace fs = std::filesystem;
using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class PrintingTest : public WatchRun {
protected:
    void SetUp() override {
        const std::string obstacle = CupsServer::Obstacle("/usr/sbin/cupsd");
        if (!obstacle.empty())
            GTEST_SKIP() << obstacle;
        m_server.AddBackend("paper", "cat \"$6\" >/dev/null && echo \"$3\" >>" + Paper().string());
    }

    void StartServer(const std::string& more = {}) {
        std::ofstream(m_server.ServerRoot() / "cupsd.conf", std::ios::app) << more;
        m_server.Start();
        m_server.AddQueue("ps0", "paper:/", {});
        ConfigurePrinting();
    }

    void ConfigurePrinting(const std::string& more = {}) const {
        Configure("[folder.print]\nqueue = 'ps0'\n" + more);
    }

    fs::path Paper() const { return m_server.Folder() / "out/paper"; }

    /// The jobs that have come out, one a line.
    Names Printed() const {
        std::istringstream lines(ReadBytes(Paper()));
        Names printed;
        for (std::string line; std::getline(lines, line);)
            printed.push_back(line);
        return printed;
    }

    /// Runs a program of the print server's.
    static void Run(const std::string& command) {
        EXPECT_EQ(std::system(command.c_str()), 0) << command;
    }

    /// Awaits a document that is so at the print server.
    /// @return its record in the queue
    nlohmann::json AwaitJob(const std::string& state,
                            const std::function<bool(const nlohmann::json&)>& isSo) const {
        nlohmann::json found;
        Await(state, [&] {
            const auto jobs = Ask({"queue", "--state", state}).Records("job");
            found = jobs.size() == 1 ? jobs[0] : nlohmann::json();
            return jobs.size() == 1 && isSo(found);
        });
        return found;
    }

    nlohmann::json AwaitAtPrinter() const {
        return AwaitJob("printing", [](const auto& job) { return !job["print"].is_null(); });
    }

    void AwaitDone() const {
        AwaitFile(m_folder / "in/processed/a.doc");
        EXPECT_THAT(FilesIn("in"), ElementsAre("processed/a.doc"));
        EXPECT_THAT(FilesIn("out"), IsEmpty());
    }

    CupsServer m_server;
};

TEST_F(PrintingTest, PaperComesOutAndWhereAskedForTheFileToo) {
    StartServer();
    Put("a.doc");
    EXPECT_EQ(WatchOnce().exitCode, 0);
    AwaitDone();
    EXPECT_THAT(Printed(), ElementsAre("a.doc (letters 1)"));
    ConfigurePrinting("keep = true\ncopies = 2\nsheets = 'none'\n");
    Put("b.doc");
    EXPECT_EQ(WatchOnce().exitCode, 0);
    EXPECT_THAT(FilesIn("out"), ElementsAre("b.ps"));
    EXPECT_EQ(Printed().size(), 2U);
}

TEST_F(PrintingTest, SaysWhatCannotBePrintedSo) {
    StartServer();
    const struct {
        const char* more;
        int exitCode;
        const char* reason;
    } cases[] = {
        {"copies = 2\n", 0, ""},
        {"queue = 'other'\n", 3, "other"},
        {"sheets = 'both'\n", 3, "both"},
        {"sides = 'one-sided'\n", 3, "no option"},
        {"options = { Colour = 'yes' }\n", 3, "Colour"},
        {"pages = '3-1'\n", 3, ":14:"},
        {"copies = 0\n", 3, ":14:"},
        {"media = \"A4\\nA5\"\n", 3, ":14:"},
        {"colour = true\n", 3, "there is no key"},
        {"server = '/nobody/there'\n", 3, "cannot be reached"},
    };
    for (const auto& [more, exitCode, reason] : cases) {
        std::string lines = "[folder.print]\n";
        lines += std::string(more).rfind("queue", 0) == 0 ? "" : "queue = 'ps0'\n";
        Configure(lines + more);
        const RunResult run = RunQuillon(Watch({"--check"}));
        EXPECT_EQ(run.exitCode, exitCode) << run.err;
        EXPECT_THAT(run.err, HasSubstr(reason));
    }
    Run("/usr/sbin/cupsreject -r 'being moved' ps0");
    ConfigurePrinting();
    EXPECT_THAT(RunQuillon(Watch({"--check"})).err,
                HasSubstr("no jobs at the moment: being moved"));
}

/// What is there in place of a print server.
TEST_F(PrintingTest, SaysWhatIsNoPrintServer) {
    using httplib::Response;
    const struct {
        const char* name;
        std::function<void(Response&)> answer;
        const char* reason;
    } cases[] = {
        {"a web page", [](Response& to) { to.set_content("<html>", "text/html"); }, "not as a"},
        {"garbage", [](Response& to) { to.set_content("\1\1xx", "application/ipp"); }, "not as a"},
        {"an end",
         [](Response& to) {
             to.set_content_provider(9, "application/ipp",
                                     [](auto, auto, httplib::DataSink&) { return false; });
         },
         "not answer"},
        {"a lock",
         [](Response& to) {
             to.status = 401;
             to.set_header("WWW-Authenticate", "Basic realm=\"CUPS\"");
         },
         "asks for a password"},
        {"a closed door", [](Response& to) { to.status = 403; }, "does not let this user"},
        {"a break", [](Response& to) { to.status = 503; }, "not answer"},
    };
    for (const auto& [name, answer, reason] : cases) {
        SCOPED_TRACE(name);
        httplib::Server server;
        server.Post(".*", [&answer = answer](const auto&, Response& to) { answer(to); });
        const int port = server.bind_to_any_port("127.0.0.1");
        std::thread thread([&server] { server.listen_after_bind(); });
        ConfigurePrinting("server = '127.0.0.1:" + std::to_string(port) + "'\n");
        const RunResult run = RunQuillon(Watch({"--check"}));
        EXPECT_EQ(run.exitCode, 3);
        EXPECT_THAT(run.err, HasSubstr(reason));
        server.stop();
        thread.join();
    }
}

TEST_F(PrintingTest, WaitsForAPrinterThatIsAwayOrFull) {
    StartServer("MaxJobs 1\n");
    Run("/usr/sbin/cupsdisable ps0");
    Run("echo x | lp -s -d ps0 -t other");
    Put("a.doc");
    const RunningProgram watch(QuillonCommand(Watch()));
    AwaitJob("submitting", [](const auto&) { return true; });
    Run("cancel -a ps0");
    AwaitAtPrinter();
    EXPECT_THAT(FilesIn("in"), ElementsAre("a.doc"));
    Run("/usr/sbin/cupsenable ps0");
    AwaitDone();
    EXPECT_THAT(Printed(), ElementsAre("a.doc (letters 1)"));
}

TEST_F(PrintingTest, WhatIsCancelledFails) {
    StartServer();
    Run("/usr/sbin/cupsdisable ps0");
    Put("a.doc");
    const RunningProgram watch(QuillonCommand(Watch()));
    const auto id = std::to_string(AwaitAtPrinter()["id"].get<int>());
    EXPECT_EQ(Ask({"cancel", id}).exitCode, 0);
    AwaitFile(m_folder / "in/failed/a.doc.txt");
    EXPECT_THAT(ReadBytes(m_folder / "in/failed/a.doc.txt"), HasSubstr("cancelled"));
    EXPECT_EQ(Ask({"cancel", id}).exitCode, 1) << "it is there no more";
}

TEST_F(PrintingTest, WhatThePrinterGivesUpFails) {
    StartServer();
    m_server.AddBackend("wet", "echo 'ERROR: the paper is wet' >&2; exit 1");
    m_server.AddQueue("ps0", "wet:/", {});
    Run("lpadmin -p ps0 -o printer-error-policy=abort-job");
    Put("a.doc");
    EXPECT_EQ(WatchOnce().exitCode, 1);
    EXPECT_THAT(ReadBytes(m_folder / "in/failed/a.doc.txt"),
                HasSubstr("given up job 1 of ps0: the paper is wet"));
}

TEST_F(PrintingTest, WhatIsLostAgainIsHeld) {
    StartServer("PreserveJobHistory No\n"); // as if what is on paper were lost
    ConfigurePrinting("after_loss = 'print'\n");
    Put("a.doc");
    const RunningProgram watch(QuillonCommand(Watch()));
    AwaitJob("printing", [](const auto& job) { return job["print"]["held"].template get<bool>(); });
    EXPECT_EQ(Printed().size(), 2U);
}

TEST_F(PrintingTest, AJobThatTheServerHasLostIsHeldAndTold) {
    StartServer();
    Run("/usr/sbin/cupsdisable ps0");
    Put("a.doc");
    const RunningProgram watch(QuillonCommand(Watch()));
    AwaitAtPrinter();
    m_server.Kill();
    for (const char* const folder : {"spool", "cache"})
        for (const auto& entry : fs::directory_iterator(m_server.Folder() / folder))
            fs::remove_all(entry);
    m_server.Start();
    Run("/usr/sbin/cupsenable ps0");
    Run("echo x | lp -s -d ps0 -t other"); // which gets the number
    const auto job = AwaitJob(
        "printing", [](const nlohmann::json& each) { return each["print"]["held"].get<bool>(); });
    EXPECT_THAT(job["reason"].get<std::string>(), HasSubstr("lost"));
    Await("the other job", [this] { return Printed() == Names{"other"}; });
    Run("lp -s -i ps0-" + std::to_string(job["print"]["job"].get<int>()) + " -H resume");
    AwaitDone();
    EXPECT_THAT(Printed(), ElementsAre("other", "a.doc (letters 1)"));
}

TEST_F(PrintingTest, ConvertPrintsAndWaitsForThePaper) {
    StartServer();
    const std::string document = m_folder.Write("a.doc", "script").u8string();
    const auto convert = [&](Arguments more, const char* queue = "ps0") {
        more.insert(more.begin(), {"convert", document, "--json", "--print", queue});
        return RunQuillon(more);
    };
    RunResult run = convert({"--wait"});
    EXPECT_EQ(run.exitCode, 0) << run.err;
    EXPECT_EQ(run.Records("document").at(0)["output"], nullptr);
    EXPECT_EQ(run.Records("print").at(0)["state"], "printed");
    EXPECT_EQ(convert({"--out", Path("out"), "--print-option", "copies=2", "--wait"}).exitCode, 0);
    EXPECT_THAT(FilesIn("out"), ElementsAre("a.ps"));
    EXPECT_THAT(Printed(), ElementsAre("a.doc", "a.doc"));
    EXPECT_EQ(convert({}, "other").exitCode, 3);
    EXPECT_EQ(convert({"--print-option", "Tray=2"}).exitCode, 3);
    Run("/usr/sbin/cupsreject ps0");
    EXPECT_EQ(convert({}).exitCode, 2);
    Run("/usr/sbin/cupsaccept ps0");
    Run("/usr/sbin/cupsdisable ps0");
    RunningProgram waiting(QuillonCommand({"convert", document, "--print", "ps0", "--wait"}));
    Await("the job", [] { return std::system("lpstat -o | grep -q .") == 0; });
    Run("cancel -a ps0");
    EXPECT_EQ(waiting.Wait().exitCode, 1);
}

TEST_F(PrintingTest, WhereverOneOfThemDiesNothingIsPrintedTwice) {
    StartServer();
    std::size_t printed = 0;
    bool died = true;
    for (int step = 15; died && !HasFailure(); step += 3) { // it is submitted after these
        SCOPED_TRACE("ended before step " + std::to_string(step));
        for (const char* const file :
             {"journal.db", "journal.db-wal", "journal.db-shm", "in/processed/a.doc"})
            fs::remove(m_folder / file);
        Put("a.doc");
        {
            const DyingProgram dying(step);
            died = WatchOnce().exitCode == -SIGKILL;
        }
        EXPECT_EQ(WatchOnce().exitCode, 0);
        AwaitDone();
        EXPECT_EQ(Printed().size(), ++printed);
    }
    EXPECT_GT(printed, 5U) << "the steps were not seen";
}

} // namespace
