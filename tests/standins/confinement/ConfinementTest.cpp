#include "standins/confinement/Confinement.h"

#include "standins/inprocess/SupervisedRun.h"
#include "standins/shared/WorkFolder.h"
#include "tests/standins/LoopbackListener.h"
#include "tests/standins/confinement/Attempts.h"
#include "tests/support/TemporaryFolder.h"

#include <fcntl.h>
#include <gmock/gmock.h>
#include <sys/prctl.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <cstdlib>
#include <fstream>

namespace fs = std::filesystem;
using namespace std::chrono_literals;
using testing::HasSubstr;
using testing::Not;

namespace {

/// A process of the user's that whoever has the user's rights may trace.
class OtherProcess {
public:
    OtherProcess() : m_id(fork()) {
        if (m_id != 0)
            return;
        prctl(PR_SET_PDEATHSIG, SIGKILL);
        prctl(PR_SET_PTRACER, PR_SET_PTRACER_ANY);
        for (;;)
            pause();
    }
    ~OtherProcess() {
        kill(m_id, SIGKILL);
        waitpid(m_id, nullptr, 0);
    }
    OtherProcess(const OtherProcess&) = delete;
    OtherProcess& operator=(const OtherProcess&) = delete;
    pid_t Id() const { return m_id; }

private:
    pid_t m_id;
};

standins::Descriptor LocalSocket(const fs::path& path, int type) {
    standins::Descriptor made(socket(AF_UNIX, type | SOCK_CLOEXEC, 0));
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    path.string().copy(address.sun_path, sizeof address.sun_path - 1);
    EXPECT_EQ(0, bind(made.Get(), reinterpret_cast<sockaddr*>(&address), sizeof address)) << path;
    if (type == SOCK_STREAM)
        listen(made.Get(), 16);
    return made;
}

/// A folder of the user's, a listener and a process: what a document is to be kept from.
class ConfinementTest : public testing::Test {
protected:
    ConfinementTest() {
        for (const char* file : {"secret", "other"})
            m_users.Write(file, "the user's");
        for (const char* folder : {"bin", "lib"})
            fs::create_directory(m_engine / folder);
        m_engine.Write("lib/targets", Targets());
    }

    std::string Targets() const {
        return m_users.Path().string() + ' ' + std::to_string(m_listener.Port()) + ' ' +
               std::to_string(m_process.Id());
    }

    /// Runs the probe as an engine called `name`.
    /// @return the run's result
    standins::Message Run(const std::string& name, const std::string& supervisor,
                          const std::vector<std::string>& arguments,
                          const std::vector<int>& descriptors) {
        fs::copy_file(PROBE, m_engine / "bin" / name);
        standins::SupervisedRun run;
        run.engine = name;
        run.supervisor = STANDINS_FOLDER "/" + supervisor;
        run.arguments = arguments;
        run.descriptors = descriptors;
        run.folder = standins::WorkFolder::NewPath("test");
        run.limits = {60s, 60s};
        run.mostMemory = std::uint64_t{1} << 30;
        return standins::RunSupervised(run);
    }

    void ExpectRefused(const std::string& outcomes) const {
        EXPECT_THAT(outcomes, HasSubstr("read a file: refused\n"));
        EXPECT_THAT(outcomes, Not(HasSubstr("through")));
        EXPECT_FALSE(m_listener.HasVisitor());
        EXPECT_EQ("the user's", ReadBytes(m_users / "secret"));
    }

    TemporaryFolder m_users;
    TemporaryFolder m_engine; ///< where it is installed
    LoopbackListener m_listener;
    standins::Descriptor m_stream = LocalSocket(m_users / "stream", SOCK_STREAM);
    standins::Descriptor m_datagrams = LocalSocket(m_users / "datagrams", SOCK_DGRAM);
    OtherProcess m_process;
};

/// In a process of its own, which ends as one does that finds its memory damaged.
/// @param anothers a file that belongs to another child
[[noreturn]] void AttemptAsChild(const fs::path& own, const fs::path& anothers,
                                 const std::string& targets) {
    standins::Reach reach;
    reach.workFolder = own;
    fs::current_path(own);
    if (standins::Confine(reach) && access(anothers.c_str(), F_OK) == 0 &&
        open(anothers.c_str(), O_RDONLY | O_CLOEXEC) < 0)
        std::ofstream("outcomes") << Attempt(targets) << std::flush;
    std::abort();
}

std::string ReadWhole(int file) {
    return ReadBytes("/proc/self/fd/" + std::to_string(file));
}

} // namespace

TEST_F(ConfinementTest, WithoutItEveryAttemptComesThrough) {
    const std::string outcomes = m_engine / "outcomes";
    const std::string command =
        "cd '" + m_engine.Path().string() + "' && '" PROBE "' '" + Targets() + "' > outcomes";
    ASSERT_EQ(0, std::system(command.c_str())); // NOLINT(concurrency-mt-unsafe,cert-env33-c)
    std::string text = ReadBytes(outcomes);
    // Systems switch it off.
    const std::string ring = "use io_uring: refused\n";
    if (const std::size_t found = text.find(ring); found != std::string::npos)
        text.erase(found, ring.size());
    EXPECT_THAT(text, HasSubstr("read a file: through\n"));
    EXPECT_THAT(text, Not(HasSubstr("refused")));
    EXPECT_TRUE(m_listener.HasVisitor());
}

TEST_F(ConfinementTest, LibreOfficeReachesNothing) {
    const fs::path path = m_engine.Write("new.docx", "a document");
    const standins::Descriptor document(open(path.c_str(), O_RDONLY | O_CLOEXEC));
    const std::string program = m_engine / "bin";
    const standins::Message result = Run("soffice.bin", "office-engine",
                                         {"--program=" + program, "--document=" + path.string(),
                                          "--extension=docx", "--import=x", "--export=pdf:x"},
                                         {document.Get()});
    ASSERT_EQ(standins::MessageKind::Done, result.kind) << result.text;
    ExpectRefused(ReadWhole(result.attachment.Get()));
}

TEST_F(ConfinementTest, AForkedChildReachesNoMoreThanItsOwn) {
    const fs::path own = m_engine / "bin";
    const pid_t parent = fork();
    if (parent == 0) {
        standins::Reach ofAll;
        ofAll.workFolder = m_engine.Path();
        ofAll.mayFork = true;
        const pid_t child = standins::Confine(ofAll) ? fork() : -1;
        if (child == 0)
            AttemptAsChild(own, m_engine / "lib/targets", Targets());
        int status = 0;
        _exit(waitpid(child, &status, 0) == child && WIFSIGNALED(status) ? WTERMSIG(status) : 0);
    }
    int status = 0;
    EXPECT_EQ(parent, waitpid(parent, &status, 0));
    EXPECT_EQ(SIGABRT, WEXITSTATUS(status));
    ExpectRefused(ReadBytes(own / "outcomes"));
}

TEST_F(ConfinementTest, GhostscriptReachesNothing) {
    const fs::path path = m_engine.Write("new.ps", "a program");
    const standins::Descriptor postScript(open(path.c_str(), O_RDONLY | O_CLOEXEC));
    const standins::Descriptor pdf(
        open(m_engine.Path().c_str(), O_TMPFILE | O_RDWR | O_CLOEXEC, 0600));
    const std::string program = m_engine / "bin/gs";
    const standins::Message result =
        Run("gs", "distiller-engine", {"--program=" + program}, {postScript.Get(), pdf.Get()});
    ASSERT_EQ(standins::MessageKind::Done, result.kind) << result.text;
    ExpectRefused(ReadWhole(pdf.Get()));
}

TEST_F(ConfinementTest, ThePrinterReachesNothing) {
    const std::string command =
        "cd '" + m_engine.Path().string() + "' && TARGETS='" + Targets() +
        "' ASAN_OPTIONS=verify_asan_link_order=0 LD_PRELOAD='" + PROBE_OF_PRINTER +
        "' '" STANDINS_FOLDER "/pdf-to-ps' --total=60 --memory=1000000000 < /dev/null > outcomes";
    ASSERT_EQ(0, std::system(command.c_str())); // NOLINT(concurrency-mt-unsafe,cert-env33-c)
    ExpectRefused(ReadBytes(m_engine / "outcomes"));
}

TEST_F(ConfinementTest, WhatTheSystemLacksIsTold) {
    const fs::path log = m_engine / "log";
    const auto run = [&](const std::string& call, const std::string& arguments) {
        const std::string command = "'" WITHOUT "' " + call + " '" PROGRAM "' " + arguments +
                                    " > '" + log.string() + "' 2>&1";
        return WEXITSTATUS(
            std::system(command.c_str())); // NOLINT(concurrency-mt-unsafe,cert-env33-c)
    };
    const std::pair<const char*, const char*> lacks[] = {
        {"landlock_create_ruleset",
         "files are not kept from documents: the kernel has no Landlock"},
        {"seccomp", "network and processes are not kept from documents: the kernel has no seccomp"},
    };
    for (const auto& [call, words] : lacks) {
        EXPECT_EQ(0, run(call, "status"));
        EXPECT_THAT(ReadBytes(log), HasSubstr(std::string("incomplete: ") + words));
        const std::string convert = "convert '" SAMPLES_FOLDER "/letter.docx' --ps --out '" +
                                    m_engine.Path().string() + "'";
        EXPECT_EQ(2, run(call, convert + " --require-isolation"));
        EXPECT_THAT(ReadBytes(log), HasSubstr(words));
        EXPECT_EQ(0, run(call, convert)); // with what there is
        EXPECT_THAT(ReadBytes(log), HasSubstr(std::string("Documents are not isolated: ") + words));
    }
}
