#include "tests/standins/Processes.h"
#include "tests/standins/distiller/BridgeTest.h"

#include <gmock/gmock.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <thread>

namespace fs = std::filesystem;
using testing::HasSubstr;

namespace {

class GhostscriptFaultsTest : public BridgeTest {
protected:
    /// Puts a Ghostscript that does what a shell script says in the place of the real one. It can
    /// start no program. Descriptor 4 is the PDF.
    void Replace(const std::string& script) const {
        fs::create_directories(m_temporary.Path() / "quillon-test-bin");
        const fs::path program =
            m_temporary.Write("quillon-test-bin/gs", "#!/bin/sh\n" + script + "\n");
        fs::permissions(program, fs::perms::owner_all);
        setenv("PATH", program.parent_path().c_str(), 1);
    }

    /// Converts an endless program, and meanwhile sends a signal to the process that `find` waits
    /// for.
    std::string FailureBySignal(pid_t (*find)(const fs::path&), int number) {
        std::thread other([&] {
            const pid_t found = find(m_temporary.Path());
            EXPECT_GT(found, 0);
            if (found > 0)
                kill(found, number);
        });
        std::string failure = Failure(EndlessProgram);
        other.join();
        return failure;
    }
};

} // namespace

TEST_F(GhostscriptFaultsTest, EachWayToFailHasItsReason) {
    const std::string start = "printf '%%PDF-1.7\\n' >&4\n";
    const std::string end = "printf '%%%%EOF\\n' >&4\n";
    const std::pair<std::string, const char*> engines[] = {
        {"exit 0", "Ghostscript made no whole PDF of it"},
        {start, "made no whole PDF"},
        {end, "made no whole PDF"},
        {start + end + "echo 'ERROR: ioerror (-12) on closing pdfwrite device.'", "no whole PDF"},
        {start + end + "exit 1", "Ghostscript ended with exit code 1."},
        {start + end + "echo 'Error: /undefined in x'; exit 1", "error in it: undefined in x."},
        {start + end + "kill -KILL $$", "ended with signal 9 (Killed)"},
        {start + end + "kill -XFSZ $$", "wrote a larger file than it may"},
    };
    for (const auto& [script, reason] : engines) {
        Replace(script);
        EXPECT_THAT(Failure("%!PS\nshowpage\n"), HasSubstr(reason)) << script;
    }
    fs::permissions(m_temporary / "quillon-test-bin/gs", fs::perms::owner_read);
    EXPECT_THAT(Failure("%!PS\nshowpage\n"), HasSubstr("Ghostscript is not installed"));
}

TEST_F(GhostscriptFaultsTest, AnEndlessProgramIsEnded) {
    SetLimit(L"TotalSeconds", 1);
    EXPECT_THAT(Failure(EndlessProgram), HasSubstr("Ghostscript took longer than 1 seconds"));
    EXPECT_THAT(Failure("%!PS\n{ (text that fills the log\n) print } loop\n"),
                HasSubstr("took longer than 1 seconds"));
}

TEST_F(GhostscriptFaultsTest, ItMayBeKilledOrStopped) {
    EXPECT_THAT(FailureBySignal(AwaitEngine, SIGKILL), HasSubstr("signal 9 (Killed)"));
    EXPECT_THAT(FailureBySignal(AwaitSupervisor, SIGKILL),
                HasSubstr("supervisor ended unexpectedly"));
    SetLimit(L"StallSeconds", 1);
    EXPECT_THAT(FailureBySignal(AwaitEngine, SIGSTOP),
                HasSubstr("Ghostscript stopped responding for 1 seconds"));
}

TEST_F(GhostscriptFaultsTest, NothingOutlivesAClientThatIsKilled) {
    const fs::path postScript = m_files.Write("endless.ps", EndlessProgram);
    const pid_t client = fork();
    if (client == 0)
        _exit(Convert(postScript, m_files / "endless.pdf"));
    EXPECT_GT(AwaitEngine(m_temporary.Path()), 0);
    kill(client, SIGKILL);
    waitpid(client, nullptr, 0);
    EXPECT_TRUE(Await([&] { return Leftovers().empty(); })) << Leftovers();
    EXPECT_EQ((std::set<std::string>{"endless.ps"}), Names());
}

TEST_F(GhostscriptFaultsTest, ConversionsOnSeveralThreadsDoNotMeet) {
    constexpr int Threads = 4;
    std::vector<std::thread> threads;
    threads.reserve(Threads);
    for (int i = 0; i < Threads; ++i)
        threads.emplace_back([this, i] {
            const std::string name = std::to_string(i);
            const fs::path postScript =
                m_files.Write(name + ".ps", i % 2 == 0 ? "%!PS\nshowpage\n" : "%!PS\nbad\n");
            EXPECT_EQ(i % 2 == 0 ? 0 : 5, Convert(postScript, m_files / (name + ".pdf"))) << i;
        });
    for (std::thread& thread : threads)
        thread.join();
    EXPECT_EQ((std::set<std::string>{"0.ps", "0.pdf", "1.ps", "2.ps", "2.pdf", "3.ps"}), Names());
}
