#include "tests/standins/Documents.h"
#include "tests/standins/FakeEngine.h"
#include "tests/standins/OfficeClient.h"
#include "tests/standins/OfficeTest.h"
#include "tests/standins/Processes.h"

#include <gmock/gmock.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <thread>

using testing::HasSubstr;
using namespace std::chrono_literals;

namespace {

class EngineFaultsTest : public OfficeTest {
protected:
    /// A document that no test before has opened.
    std::wstring NewDocument() {
        static int number = 0;
        const std::string name = "document" + std::to_string(++number);
        return m_files.Write(name + ".docx", name + std::to_string(getpid())).wstring();
    }

    std::wstring OpenNewDocument() {
        const std::wstring path = NewDocument();
        WordClient word;
        return RaisedBy([&] { word.Open(path); });
    }

    /// A document that keeps LibreOffice at work for some seconds.
    std::wstring LongDocument() {
        std::string body;
        for (int i = 0; i < 30000; ++i)
            body += Paragraph("Paragraph " + std::to_string(i) + " of a long document.");
        return WidePath(m_files.Write("long.docx", WordPackage(body)));
    }

    /// Opens a document, and meanwhile sends a signal to the process that `find` waits for.
    std::wstring OpenAndSignal(const std::wstring& path,
                               const std::function<pid_t(const std::filesystem::path&)>& find,
                               int number) {
        pid_t found = 0;
        std::thread other([&] {
            found = find(m_temporary.Path());
            if (found > 0)
                kill(found, number);
        });
        WordClient word;
        std::wstring raised = RaisedBy([&] { word.Open(path); });
        other.join();
        EXPECT_GT(found, 0);
        return raised;
    }
};

const std::wstring CannotBeOpened = L".docx cannot be opened: ";

} // namespace

TEST_F(EngineFaultsTest, EachWayToFailHasItsReason) {
    const std::string orphans = "setsid sleep 600 &\n"                // leaves the group
                                "env -i setsid setsid sleep 600 &\n"; // and its home
    const std::vector<std::pair<std::string, const wchar_t*>> engines = {
        {"exit 0", L"LibreOffice loaded it, but made no pages of it."},
        {"echo 'Error: source file could not be loaded'", L"LibreOffice cannot load it"},
        {"echo garbage > $PDF", L"LibreOffice loaded it, but made no pages of it."},
        {": > $PDF", L"made no pages"},
        {"ln -s /etc/passwd $PDF", L"made no pages"},
        {"mkfifo $PDF", L"made no pages"},
        {FakeEngine::MakePdf() + "exit 1", L"LibreOffice ended with exit code 1."},
        {FakeEngine::MakePdf() + "kill -KILL $$", L"LibreOffice ended with signal 9 (Killed)."},
        {"kill -SEGV $$", L"LibreOffice ended with signal 11 (Segmentation fault)."},
        {"kill -XCPU $$", L"LibreOffice used more processor time than it may."},
        {"exit 81", L"LibreOffice ended with exit code 81."}, // wants to be started for ever
        {orphans + "exit 0", L"made no pages"},
    };
    for (const auto& [script, reason] : engines) {
        const FakeEngine engine(script);
        const std::wstring raised = OpenNewDocument();
        EXPECT_THAT(raised, HasSubstr(CannotBeOpened)) << script;
        EXPECT_THAT(raised, HasSubstr(reason)) << script;
        EXPECT_EQ("", Leftovers()) << script;
    }
}

TEST_F(EngineFaultsTest, AnEngineThatWantsToStartAgainMay) {
    const FakeEngine engine("test -e once || { touch once; exit 81; }\n" + FakeEngine::MakePdf());
    EXPECT_EQ(L"", OpenNewDocument());
    EXPECT_EQ(2U, engine.Starts());
}

TEST_F(EngineFaultsTest, AnEngineWithoutASignOfLifeIsEnded) {
    SetLimit(L"StallSeconds", 1);
    for (const char* script : {"kill -STOP $$", "sleep 600", "trap '' TERM; setsid sleep 600"}) {
        const FakeEngine engine(script);
        EXPECT_THAT(OpenNewDocument(), HasSubstr(L"stopped responding for 1 seconds")) << script;
        EXPECT_EQ("", Leftovers()) << script;
    }
}

TEST_F(EngineFaultsTest, AnEngineThatNeverEndsIsEnded) {
    SetLimit(L"StallSeconds", 1);
    SetLimit(L"TotalSeconds", 2);
    for (const char* script : {"while :; do :; done",                                   // busy
                               "while :; do echo x >> file; sleep 0.1; done & wait"}) { // writing
        const FakeEngine engine(script);
        EXPECT_THAT(OpenNewDocument(), HasSubstr(L"took longer than 2 seconds")) << script;
    }
}

TEST_F(EngineFaultsTest, AnEngineThatIsNotThereIsTold) {
    {
        const FakeEngine engine("exit 0");
        engine.Uninstall();
        EXPECT_THAT(OpenNewDocument(), HasSubstr(L"LibreOffice cannot be started"));
    }
    EXPECT_THAT(OpenNewDocument(), HasSubstr(L"LibreOffice is not installed"));
}

TEST_F(EngineFaultsTest, TheEngineMayBeKilledOrStoppedAtAnyTime) {
    NEEDS_LIBREOFFICE();
    const std::wstring path = LongDocument();
    EXPECT_EQ(L"long.docx cannot be opened: LibreOffice ended with signal 9 (Killed).",
              OpenAndSignal(path, AwaitEngine, SIGKILL));
    EXPECT_EQ("", Leftovers());
    SetLimit(L"StallSeconds", 1);
    EXPECT_EQ(L"long.docx cannot be opened: LibreOffice stopped responding for 1 seconds.",
              OpenAndSignal(path, AwaitEngine, SIGSTOP));
}

TEST_F(EngineFaultsTest, TheSupervisorMayBeKilledOrStopped) {
    const auto ready = m_files / "ready";
    const FakeEngine engine("setsid sleep 600 &\n: > '" + ready.string() +
                            "'\nwhile :; do :; done");
    const auto find = [&](const std::filesystem::path& temporary) {
        Await([&] { return std::filesystem::remove(ready); });
        return AwaitSupervisor(temporary);
    };
    EXPECT_THAT(OpenAndSignal(NewDocument(), find, SIGKILL),
                HasSubstr(L"supervisor ended unexpectedly"));
    EXPECT_EQ("", Leftovers());
    SetLimit(L"StallSeconds", 1);
    EXPECT_THAT(OpenAndSignal(NewDocument(), find, SIGSTOP),
                HasSubstr(L"supervisor stopped responding"));
}

TEST_F(EngineFaultsTest, PoliteSignalsDoNotKeepTheSupervisorFromItsWork) {
    const FakeEngine engine("until test -e '" + (m_files / "go").string() + "'; do :; done\n" +
                            FakeEngine::MakePdf());
    std::thread other([&] {
        const pid_t supervisor = AwaitSupervisor(m_temporary.Path());
        for (const int number : {SIGTERM, SIGINT, SIGHUP})
            kill(supervisor, number);
        m_files.Write("go", "");
    });
    EXPECT_EQ(L"", OpenNewDocument());
    other.join();
}

TEST_F(EngineFaultsTest, NothingOutlivesAClientThatIsKilled) {
    NEEDS_LIBREOFFICE();
    const std::string path = std::filesystem::path(LongDocument());
    const pid_t client = fork();
    if (client == 0) {
        execl(OFFICE_CLIENT, OFFICE_CLIENT, path.c_str(), nullptr);
        _exit(127);
    }
    EXPECT_GT(AwaitEngine(m_temporary.Path()), 0);
    kill(client, SIGKILL);
    waitpid(client, nullptr, 0);
    EXPECT_TRUE(Await([&] { return Leftovers().empty(); })) << Leftovers();
}

TEST_F(EngineFaultsTest, ApplicationsOnSeveralThreadsDoNotMeet) {
    const FakeEngine engine("case $(cat \"$DOCUMENT\") in *bad*) exit 3;; esac\n" +
                            FakeEngine::MakePdf());
    constexpr int Threads = 8;
    std::vector<std::thread> threads;
    threads.reserve(Threads);
    for (int i = 0; i < Threads; ++i)
        threads.emplace_back([this, i] {
            CoInitialize(nullptr);
            {
                const std::string name = (i % 2 == 0 ? "good" : "bad") + std::to_string(i);
                const auto path = m_files.Write(name + ".docx", name + std::to_string(getpid()));
                WordClient word;
                const std::wstring raised = RaisedBy([&] {
                    word::Document document = word.Open(WidePath(path));
                    PrintDocument(document, PrintArguments(PathOf(name + ".ps")));
                });
                EXPECT_EQ(i % 2 == 0, raised.empty()) << name;
            }
            CoUninitialize();
        });
    for (std::thread& thread : threads)
        thread.join();
}

TEST_F(EngineFaultsTest, ManyDocumentsInARowLeaveNoDescriptorsBehind) {
    const FakeEngine engine("exit 1");
    const auto descriptors = [] {
        const std::filesystem::directory_iterator all("/proc/self/fd");
        return std::distance(begin(all), end(all));
    };
    OpenNewDocument();
    const auto before = descriptors();
    for (int i = 0; i < 20; ++i)
        OpenNewDocument();
    EXPECT_EQ(before, descriptors());
}
