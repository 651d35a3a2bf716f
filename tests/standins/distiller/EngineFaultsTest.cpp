#include "tests/standins/ScriptedProgram.h"
#include "tests/standins/distiller/BridgeTest.h"

#include <gmock/gmock.h>

#include <csignal>
#include <future>

namespace fs = std::filesystem;
using testing::HasSubstr;

namespace {

class GhostscriptFaultsTest : public BridgeTest {
protected:
    /// Puts a Ghostscript that does what a shell script says in the place of the real one.
    /// Descriptor 4 is the PDF.
    void Replace(const std::string& script) const {
        for (const char* folder : {"bin", "lib"})
            fs::create_directories(m_files / folder);
        WriteScriptedProgram(m_files / "bin/gs", m_files / "lib", script);
        setenv("PATH", (m_files / "bin").c_str(), 1);
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
        {start + end + "kill -XFSZ $$", "wrote a larger file than it may"},
    };
    for (const auto& [script, reason] : engines) {
        Replace(script);
        EXPECT_THAT(Failure("%!PS\nshowpage\n"), HasSubstr(reason)) << script;
    }
    fs::permissions(m_files / "bin/gs", fs::perms::owner_read);
    EXPECT_THAT(Failure("%!PS\nshowpage\n"), HasSubstr("Ghostscript is not installed"));
}

TEST_F(GhostscriptFaultsTest, AnEndlessProgramIsEnded) {
    SetLimit("TotalSeconds", 1);
    for (const char* program : {EndlessProgram, "%!PS\n{ (text that fills the log\n) print } loop"})
        EXPECT_THAT(Failure(program), HasSubstr("Ghostscript took longer than 1 seconds"));
}

TEST_F(GhostscriptFaultsTest, ItMayBeKilledOrStopped) {
    SetLimit("StallSeconds", 1);
    const auto engine = [this] { return AwaitEngine(); };
    const auto supervisor = [this] { return AwaitSupervisor(); };
    const struct {
        std::function<pid_t()> await;
        int number;
        const char* reason;
    } signals[] = {
        {engine, SIGKILL, "outside: Ghostscript was ended from outside (signal 9, Killed)"},
        {engine, SIGSTOP, "document: Ghostscript stopped responding for 1 seconds"},
        {supervisor, SIGKILL,
         "outside: Ghostscript's supervisor was ended from outside (signal 9, Killed)"},
    };
    for (const auto& signal : signals) {
        const auto other =
            std::async(std::launch::async, [&] { Signal(signal.await(), signal.number); });
        EXPECT_NE("", Failure(EndlessProgram));
        EXPECT_EQ(signal.reason, FailureLeft());
    }
}

TEST_F(GhostscriptFaultsTest, NothingOutlivesAClientThatIsKilled) {
    const fs::path postScript = m_files.Write("endless.ps", EndlessProgram);
    ExpectNothingOutlivesAKilledClient([&] { Convert(postScript, m_files / "endless.pdf"); },
                                       [&] { return AwaitEngine(); });
    EXPECT_EQ((std::set<std::string>{"endless.ps"}), Names());
}

TEST_F(GhostscriptFaultsTest, ConversionsOnSeveralThreadsDoNotMeet) {
    const auto convert = [this](const std::string& name, const char* program) {
        return std::async(std::launch::async, Convert, m_files.Write(name + ".ps", program),
                          m_files / (name + ".pdf"), std::string());
    };
    std::future<int> good = convert("good", "%!PS\nshowpage\n");
    std::future<int> bad = convert("bad", "%!PS\nbad\n");
    std::future<int> alsoGood = convert("also good", "%!PS\nshowpage\n");
    EXPECT_EQ(0, good.get());
    EXPECT_EQ(5, bad.get());
    EXPECT_EQ(0, alsoGood.get());
    EXPECT_EQ(
        (std::set<std::string>{"also good.pdf", "also good.ps", "bad.ps", "good.pdf", "good.ps"}),
        Names());
}
