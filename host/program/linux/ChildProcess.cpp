#include "host/program/system/ChildProcess.h"

#include "host/program/base/PathText.h"
#include "host/program/base/ProgramFiles.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/prctl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <cstring>

namespace {

struct Pipe {
    int from = -1;
    int to = -1;

    bool Open() {
        int ends[2];
        if (pipe2(ends, O_CLOEXEC) != 0)
            return false;
        from = ends[0];
        to = ends[1];
        return true;
    }
    ~Pipe() {
        for (const int end : {from, to})
            if (end >= 0)
                close(end);
    }

    /// Hands an end on as a stream.
    static std::FILE* Stream(int& end, const char* mode) {
        std::FILE* const stream = fdopen(end, mode);
        if (stream)
            end = -1;
        return stream;
    }
};

sigset_t RequestsToEnd() {
    sigset_t signals;
    sigemptyset(&signals);
    for (const int signal : {SIGINT, SIGTERM, SIGHUP})
        sigaddset(&signals, signal);
    return signals;
}

/// What a process is started with: requests to end, which a terminal sends to it as well, wait
/// until it says what it makes of them.
class SpawnAttributes {
public:
    SpawnAttributes() {
        posix_spawnattr_init(&m_attributes);
        const sigset_t held = RequestsToEnd();
        posix_spawnattr_setsigmask(&m_attributes, &held);
        posix_spawnattr_setflags(&m_attributes, POSIX_SPAWN_SETSIGMASK);
    }
    ~SpawnAttributes() { posix_spawnattr_destroy(&m_attributes); }
    SpawnAttributes(const SpawnAttributes&) = delete;
    SpawnAttributes& operator=(const SpawnAttributes&) = delete;

    const posix_spawnattr_t* Get() const { return &m_attributes; }

private:
    posix_spawnattr_t m_attributes = {};
};

/// @return 0, or the system's error
int Spawn(const std::vector<std::string>& arguments, int in, int out, pid_t& process) {
    const std::string program = ProgramFile().string();
    std::vector<char*> words = {const_cast<char*>(program.c_str())};
    for (const std::string& argument : arguments)
        words.push_back(const_cast<char*>(argument.c_str()));
    words.push_back(nullptr);
    const SpawnAttributes attributes;
    posix_spawn_file_actions_t actions;
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_adddup2(&actions, in, STDIN_FILENO);
    posix_spawn_file_actions_adddup2(&actions, out, STDOUT_FILENO);
    const int error =
        posix_spawn(&process, program.c_str(), &actions, attributes.Get(), words.data(), environ);
    posix_spawn_file_actions_destroy(&actions);
    return error;
}

} // namespace

std::unique_ptr<ChildProcess> ChildProcess::Start(const std::vector<std::string>& arguments,
                                                  Fault& fault) {
    Pipe down;
    Pipe up;
    pid_t process = -1;
    const int error =
        down.Open() && up.Open() ? Spawn(arguments, down.from, up.to, process) : errno;
    if (error != 0) {
        fault = {Because({error, std::generic_category()}), Blame::Machine};
        return nullptr;
    }
    LineChannel channel(Pipe::Stream(up.from, "r"), Pipe::Stream(down.to, "w"));
    return std::unique_ptr<ChildProcess>(new ChildProcess(process, std::move(channel)));
}

ChildProcess::~ChildProcess() {
    Kill();
    Wait();
}

void ChildProcess::Kill() const {
    if (m_process != None)
        kill(static_cast<pid_t>(m_process), SIGKILL);
}

Fault ChildProcess::Wait() {
    int status = 0;
    pid_t waited = -1;
    while (m_process != None && waited < 0) {
        waited = waitpid(static_cast<pid_t>(m_process), &status, 0);
        if (waited < 0 && errno != EINTR)
            break;
    }
    m_process = None;
    if (!WIFSIGNALED(status))
        return {wxString::Format("ended with exit code %d", WEXITSTATUS(status))};
    const int signal = WTERMSIG(status);
    return {wxString::Format("ended by signal %d, %s", signal, strsignal(signal)),
            signal == SIGKILL ? Blame::Outside : Blame::Document}; // it does not end by polite ones
}

LineChannel TakeStandardStreams() {
    // A process that is stopped would not see its channel closed.
    prctl(PR_SET_PDEATHSIG, SIGKILL);
    const int in = fcntl(STDIN_FILENO, F_DUPFD_CLOEXEC, 3);
    const int out = fcntl(STDOUT_FILENO, F_DUPFD_CLOEXEC, 3);
    const int nothing = open("/dev/null", O_RDONLY | O_CLOEXEC);
    dup2(nothing, STDIN_FILENO);
    dup2(STDERR_FILENO, STDOUT_FILENO);
    close(nothing);
    return {fdopen(in, "r"), fdopen(out, "w")};
}

void EndThisProcess(int exitCode) {
    std::_Exit(exitCode);
}
