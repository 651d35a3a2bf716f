#include "office/OpenXmlCheck.h"
#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/Processes.h"
#include "tests/support/RegistryText.h"
#include "tests/support/linux/ResourceLimit.h"

#include <gmock/gmock.h>

#include <array>
#include <csignal>
#include <future>

namespace fs = std::filesystem;
using testing::EndsWith;

namespace {

class EngineFaultsTest : public OfficeTest {
protected:
    /// Opens a document by an engine that is to fail.
    /// @param reason what Word says of it
    void ExpectFailure(const std::string& script, const std::string& reason,
                       const std::string& fault = "document") {
        const FakeEngine engine(script);
        EXPECT_EQ("Word: new.docx cannot be opened: " + reason + ".", Open(NewDocument()))
            << script;
        EXPECT_EQ(fault + ": " + reason, FailureLeft()) << script;
        EXPECT_EQ("", Leftovers()) << script;
    }
};

} // namespace

TEST_F(EngineFaultsTest, EachWayToFailHasItsReason) {
    const std::string noPages = "LibreOffice loaded it, but made no pages of it";
    const std::pair<std::string, std::string> engines[] = {
        {"exit 0", noPages},
        {"sleep 600 & exit 0", "LibreOffice ended with exit code 2"}, // it can start nothing
        {"echo garbage > $PDF", noPages},
        {"exec ln -s /etc/passwd $PDF", noPages},
        {"exec mkfifo $PDF", noPages},
        {"echo 'Error: source file could not be loaded'",
         "LibreOffice cannot load it; the file is damaged or not of its type"},
        {FakeEngine::MakePdf() + "exit 1", "LibreOffice ended with exit code 1"},
        {"kill -SEGV $$", "LibreOffice ended with signal 11 (Segmentation fault)"},
        {"kill -XCPU $$", "LibreOffice used more processor time than it may"},
        {"exit 81", "LibreOffice ended with exit code 81"}, // wants to be started for ever
    };
    for (const auto& [script, reason] : engines)
        ExpectFailure(script, reason);
    ExpectFailure("kill -TERM $$", "LibreOffice was ended from outside (signal 15, Terminated)",
                  "outside");
}

TEST_F(EngineFaultsTest, AnEngineThatHasTooLittleIsNoFaultOfTheDocument) {
    const struct {
        __rlimit_resource resource;
        rlim_t most;
        const char* words;
    } limits[] = {
        {RLIMIT_NOFILE, 100, "only 100 files may be open (ulimit -n)"},
        {RLIMIT_FSIZE, 1'000'000, "a file may have only 1000000 bytes (ulimit -f)"},
        {RLIMIT_CPU, 999, "a process may use only 999 seconds of processor time (ulimit -t)"},
    };
    for (const auto& [resource, most, words] : limits) {
        const ResourceLimit limit(resource, most);
        ExpectFailure("exit 1", std::string("LibreOffice ended with exit code 1; ") + words,
                      "machine");
    }
}

TEST_F(EngineFaultsTest, AnEngineThatDoesNotEndIsEnded) {
    SetLimit("StallSeconds", 1);
    SetLimit("TotalSeconds", 3);
    for (const char* script : {"kill -STOP $$", "trap '' TERM; exec sleep 600"})
        ExpectFailure(script, "LibreOffice stopped responding for 1 seconds");
    ExpectFailure("while :; do :; done", "LibreOffice took longer than 3 seconds");
}

TEST_F(EngineFaultsTest, AnEngineThatTakesTooMuchMemoryIsEnded) {
    SetLimit("StallSeconds", 5);
    SetLimit("MemoryMegabytes", 16);
    ExpectFailure("A=0123456789ABCDEF; while test ${#A} -lt 40000000; do A=$A$A; done\n"
                  "while :; do :; done",
                  "LibreOffice took more than 16 MB of memory");
}

TEST_F(EngineFaultsTest, AnEngineThatIsRemovedWhileAClientRunsIsTold) {
    WriteRegistryText(HKEY_LOCAL_MACHINE, L"SOFTWARE\\Orvanta\\Office Stand-Ins", L"EnginePath",
                      L"/nowhere");
    EXPECT_THAT(Open(NewDocument()), EndsWith("LibreOffice cannot be started."));
    EXPECT_EQ("machine: LibreOffice cannot be started", FailureLeft());
}

TEST_F(EngineFaultsTest, AnEngineThatWantsToStartAgainMay) {
    const FakeEngine engine("test -e once || { : > once; exit 81; }\n" + FakeEngine::MakePdf());
    EXPECT_EQ("", Open(NewDocument()));
    EXPECT_EQ(2U, engine.Starts());
}

TEST_F(EngineFaultsTest, LibreOfficeMayBeKilledOrStopped) {
    SetLimit("StallSeconds", 1);
    const fs::path letter = m_files.Write("letter.docx", ReadBytes(Sample("letter.docx")) + "new");
    const std::pair<int, const char*> signals[] = {
        {SIGKILL, "outside: LibreOffice was ended from outside (signal 9, Killed)"},
        {SIGSTOP, "document: LibreOffice stopped responding for 1 seconds"},
    };
    for (const auto& [number, reason] : signals) {
        const auto other = std::async(std::launch::async,
                                      [&, sent = number] { Signal(AwaitLibreOffice(), sent); });
        EXPECT_NE("", Open(letter));
        EXPECT_EQ(reason, FailureLeft());
        EXPECT_EQ("", Leftovers());
    }
}

TEST_F(EngineFaultsTest, TheSupervisorMayBeKilledOrStopped) {
    SetLimit("StallSeconds", 1);
    const FakeEngine engine(": > ready; while :; do :; done");
    const std::pair<int, const char*> signals[] = {
        {SIGKILL, "outside: LibreOffice's supervisor was ended from outside (signal 9, Killed)"},
        {SIGSTOP, "document: LibreOffice's supervisor stopped responding"},
    };
    for (const auto& [number, reason] : signals) {
        const auto other = std::async(std::launch::async, [&, sent = number] {
            AwaitInWorkFolder("ready");
            Signal(AwaitSupervisor(), sent);
        });
        EXPECT_NE("", Open(NewDocument()));
        EXPECT_EQ(reason, FailureLeft());
        EXPECT_EQ("", Leftovers());
    }
}

TEST_F(EngineFaultsTest, PoliteSignalsDoNotKeepTheSupervisorFromItsWork) {
    const FakeEngine engine("until test -e '" + (m_files / "go").string() + "'; do :; done\n" +
                            FakeEngine::MakePdf());
    const auto other = std::async(std::launch::async, [&] {
        for (const int number : {SIGTERM, SIGINT, SIGHUP})
            Signal(AwaitSupervisor(), number);
        m_files.Write("go", "");
    });
    EXPECT_EQ("", Open(NewDocument()));
}

TEST_F(EngineFaultsTest, NothingOutlivesAClientThatIsKilled) {
    const fs::path letter = m_files.Write("letter.docx", ReadBytes(Sample("letter.docx")) + "new");
    ExpectNothingOutlivesAKilledClient([&] { Open(letter); }, [&] { return AwaitLibreOffice(); });
    ExpectNothingOutlivesAKilledClient(
        [&] {
            const FakeEngine engine(": > ready; exec sleep 600");
            Open(NewDocument());
        },
        [&] {
            AwaitInWorkFolder("ready");
            Call("DllRegisterServer"); // another client's start leaves alone what is in use
            return AwaitEngine();
        });
}

TEST_F(EngineFaultsTest, ApplicationsOnSeveralThreadsDoNotMeet) {
    const FakeEngine engine("read WORDS < \"$DOCUMENT\"\n"
                            "case $WORDS in *bad*) exit 3;; esac\n" +
                            FakeEngine::MakePdf());
    std::array<std::future<void>, 8> threads;
    for (std::size_t i = 0; i < threads.size(); ++i)
        threads.at(i) = std::async(std::launch::async, [this, i] {
            const std::string name = (i % 2 == 0 ? "good" : "bad") + std::to_string(i) + ".docx";
            EXPECT_EQ(i % 2 == 0, TryOpenInWord(FilterPath(m_files.Write(name, name)))) << name;
        });
}

TEST_F(EngineFaultsTest, ManyDocumentsInARowLeaveNoDescriptorsBehind) {
    const FakeEngine engine("exit 1");
    const auto descriptors = [] {
        const fs::directory_iterator all("/proc/self/fd");
        return std::distance(begin(all), end(all));
    };
    Open(NewDocument());
    const auto before = descriptors();
    for (int i = 0; i < 20; ++i)
        Open(NewDocument());
    EXPECT_EQ(before, descriptors());
}
