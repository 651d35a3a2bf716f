// Jobs of a print server, from `lp` to the printer.

#include "tests/host/Program.h"
#include "tests/support/linux/CupsServer.h"

#include <csignal>
#include <fstream>

namespace fs = std::filesystem;
using testing::StartsWith;

namespace {

/// The processes that have a folder in their environment, and so work on what lies there.
std::vector<pid_t> ProcessesWith(const std::string& folder) {
    std::vector<pid_t> found;
    for (const auto& process : fs::directory_iterator("/proc")) {
        std::ifstream file(process.path() / "environ", std::ios::binary);
        const std::string environment(std::istreambuf_iterator<char>(file), {});
        if (environment.find("=" + folder) != std::string::npos)
            found.push_back(std::stoi(process.path().filename()));
    }
    return found;
}

/// `quillon print-server` on the folders of a print server.
RunResult PrintServer(const std::string& action, const fs::path& root, const fs::path& bin) {
    return RunProgram({QUILLON_PROGRAM, "print-server", action, "--json", "--cups-server-root",
                       root, "--cups-server-bin", bin});
}

class PrintServerTest : public testing::Test {
protected:
    void SetUp() override {
        const std::string obstacle = CupsServer::Obstacle(QUILLON_PROGRAM);
        if (!obstacle.empty())
            GTEST_SKIP() << obstacle;
        const RunResult installed =
            PrintServer("install", m_server.ServerRoot(), m_server.ServerBin());
        ASSERT_EQ(installed.exitCode, 0) << installed.err;
        m_server.Start();
        m_server.AddQueue("office", "file://" + Printed().string(),
                          fs::path(QUILLON_PROGRAM).parent_path() / "Printers/QuillonPS.ppd");
    }

    fs::path Printed() const { return m_server.Folder() / "out/printed.ps"; }

    /// @return the job's number
    static int Print(std::vector<std::string> arguments) {
        arguments.insert(arguments.begin(), {"/usr/bin/lp", "-d", "office"});
        const RunResult run = RunProgram(arguments); // "request id is office-1 (1 file(s))"
        EXPECT_EQ(run.exitCode, 0) << run.err;
        return std::stoi(run.out.substr(run.out.find("office-") + 7));
    }

    void AwaitState(int job, ipp_jstate_t state) const {
        Await("state " + std::to_string(state), [&] { return m_server.Look(job).state == state; });
        if (testing::Test::HasFailure())
            std::puts(ReadBytes(m_server.Folder() / "error_log").c_str());
    }

    std::vector<std::string> Pages() const {
        std::istringstream lines(ReadBytes(Printed()));
        std::vector<std::string> pages;
        for (std::string line; std::getline(lines, line);)
            if (line.rfind("%%Page:", 0) == 0)
                pages.push_back(line);
        return pages;
    }

    CupsServer m_server;
};

TEST_F(PrintServerTest, AJobIsPrintedAsItsOptionsSay) {
    const std::string samples = TEST_SAMPLES;
    const struct {
        std::vector<std::string> words;
        std::size_t pages;
    } rows[] = {
        {{samples + "/letter.docx"}, 1},
        {{"-o", "page-ranges=2", samples + "/report.docx"}, 1},
        {{"-t", "--help 'quoted' \"twice\"\n[x]", "-n", "2", "-o", "Handouts=6", "-o",
          "print-color-mode=monochrome", samples + "/deck.pptx"},
         2},
    };
    for (const auto& row : rows) {
        const int job = Print(row.words);
        AwaitState(job, IPP_JSTATE_COMPLETED);
        EXPECT_THAT(ReadBytes(Printed()), StartsWith("%!PS-Adobe-3.0"));
        EXPECT_EQ(Pages().size(), row.pages) << row.words.back();
    }
}

TEST_F(PrintServerTest, ARefusedDocumentSaysWhy) {
    const fs::path document = fs::path(m_server.Folder()) / "broken.docx";
    fs::copy_file(TEST_SAMPLES "/README.md", document);
    const int job = Print({document});
    AwaitState(job, IPP_JSTATE_STOPPED); // its administrator may restart it

    EXPECT_THAT(m_server.Look(job).message,
                StartsWith("broken.docx: its content is not an Office"));
    EXPECT_EQ(m_server.PrinterMessage("office"), m_server.Look(job).message);
    EXPECT_TRUE(fs::is_empty(m_server.TemporaryFiles()));
}

TEST_F(PrintServerTest, AJobIsCancelledWithAllThatWorksOnIt) {
    const std::string engine = m_server.TemporaryFiles() / "";
    const int job = Print({TEST_SAMPLES "/deck.pptx"});
    std::vector<pid_t> working;
    Await("an engine", [&] { return !(working = ProcessesWith(engine)).empty(); });
    for (const pid_t process : working)
        kill(process, SIGSTOP);
    EXPECT_EQ(RunProgram({"/usr/bin/cancel", "office-" + std::to_string(job)}).exitCode, 0);
    AwaitState(job, IPP_JSTATE_CANCELED);
    Await("the end of the engine", [&] { return ProcessesWith(engine).empty(); });
    Await("nothing left", [&] { return fs::is_empty(m_server.TemporaryFiles()); });
}

/// Where parts are put in, without a print server.
class ServerPartsTest : public testing::Test {
protected:
    ServerPartsTest() { fs::create_directories(m_folder / "lib/filter"); }

    RunResult PrintServer(const std::string& action) const {
        return ::PrintServer(action, m_folder.Path(), m_folder / "lib");
    }

    /// The state of each part, as it is told.
    static std::vector<std::string> States(const RunResult& run) {
        std::vector<std::string> states;
        for (const nlohmann::json& part : run.Records("part"))
            states.push_back(part["state"]);
        return states;
    }

    TemporaryFolder m_folder;
};

TEST_F(ServerPartsTest, ArePutInAndTakenOut) {
    const std::vector<std::string> none(3, "not installed");
    const std::vector<std::string> all(3, "installed");
    EXPECT_EQ(States(PrintServer("status")), none);
    EXPECT_EQ(PrintServer("status").exitCode, 1);
    EXPECT_EQ(States(PrintServer("install")), all);
    const auto written = fs::last_write_time(m_folder / "quillon.types");
    EXPECT_EQ(States(PrintServer("install")), all);
    EXPECT_EQ(fs::last_write_time(m_folder / "quillon.types"), written);
    std::ofstream(m_folder / "quillon.types", std::ios::app) << "# older";
    EXPECT_EQ(States(PrintServer("status")).back(), "outdated");
    EXPECT_EQ(States(PrintServer("install")), all);
    EXPECT_EQ(PrintServer("status").exitCode, 0);
    EXPECT_EQ(States(PrintServer("remove")), none);
    EXPECT_TRUE(fs::is_empty(m_folder / "lib/filter"));
    EXPECT_EQ(States(PrintServer("remove")), none);
}

TEST_F(ServerPartsTest, AreNotPutInThePlaceOfOthers) {
    m_folder.Write("other", "somebody else's");
    fs::create_symlink(m_folder / "other", m_folder / "lib/filter/quillon");
    const RunResult run = PrintServer("install");
    EXPECT_EQ(run.exitCode, 3);
    EXPECT_THAT(run.err, HasSubstr("lib/filter/quillon is not this program's"));
    EXPECT_FALSE(fs::exists(m_folder / "quillon.types"));
    EXPECT_EQ(PrintServer("remove").exitCode, 0);
    EXPECT_EQ(ReadBytes(m_folder / "lib/filter/quillon"), "somebody else's");
    EXPECT_EQ(PrintServer("replace").exitCode, 3);
}

} // namespace
