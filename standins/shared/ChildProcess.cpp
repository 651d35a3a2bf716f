#include "standins/shared/ChildProcess.h"

#include "standins/shared/ProcessTable.h"

#include <fcntl.h>
#include <spawn.h>
#include <sys/wait.h>

#include <cerrno>
#include <csignal>

namespace standins {

namespace {

/// posix_spawn's attributes: a new session, and signals as a program expects them.
class SpawnAttributes {
public:
    SpawnAttributes() {
        posix_spawnattr_init(&m_attributes);
        sigset_t signals;
        sigemptyset(&signals);
        posix_spawnattr_setsigmask(&m_attributes, &signals);
        sigfillset(&signals);
        posix_spawnattr_setsigdefault(&m_attributes, &signals);
        posix_spawnattr_setflags(&m_attributes, POSIX_SPAWN_SETSID | POSIX_SPAWN_SETSIGMASK |
                                                    POSIX_SPAWN_SETSIGDEF);
    }
    ~SpawnAttributes() { posix_spawnattr_destroy(&m_attributes); }
    SpawnAttributes(const SpawnAttributes&) = delete;
    SpawnAttributes& operator=(const SpawnAttributes&) = delete;
    const posix_spawnattr_t* Get() const { return &m_attributes; }

private:
    posix_spawnattr_t m_attributes{};
};

/// posix_spawn's list of what becomes of the descriptors.
class SpawnDescriptors {
public:
    explicit SpawnDescriptors(const std::vector<int>& descriptors) {
        posix_spawn_file_actions_init(&m_actions);
        // Out of the way of the numbers that the child gets, so that none is overwritten.
        for (const int descriptor : descriptors)
            m_copies.emplace_back(fcntl(descriptor, F_DUPFD_CLOEXEC, LowestCopy));
        for (std::size_t i = 0; i < m_copies.size(); ++i)
            posix_spawn_file_actions_adddup2(&m_actions, m_copies[i].Get(), static_cast<int>(i));
    }
    ~SpawnDescriptors() { posix_spawn_file_actions_destroy(&m_actions); }
    SpawnDescriptors(const SpawnDescriptors&) = delete;
    SpawnDescriptors& operator=(const SpawnDescriptors&) = delete;

    bool Whole() const {
        for (const Descriptor& copy : m_copies) {
            if (!copy.IsOpen())
                return false;
        }
        return true;
    }
    const posix_spawn_file_actions_t* Get() const { return &m_actions; }

private:
    static constexpr int LowestCopy = 16;

    posix_spawn_file_actions_t m_actions{};
    std::vector<Descriptor> m_copies;
};

} // namespace

std::vector<char*> ExecWords(std::vector<std::string>& words) {
    std::vector<char*> pointers;
    pointers.reserve(words.size() + 1);
    for (std::string& word : words)
        pointers.push_back(word.data());
    pointers.push_back(nullptr);
    return pointers;
}

std::optional<ChildProcess> ChildProcess::Start(const std::string& program,
                                                const std::vector<std::string>& arguments,
                                                const std::vector<int>& descriptors,
                                                Environment environment) {
    const SpawnDescriptors given(descriptors);
    if (!given.Whole()) {
        errno = EMFILE; // whatever the system calls it
        return std::nullopt;
    }
    std::vector<std::string> words{program};
    words.insert(words.end(), arguments.begin(), arguments.end());
    char* nothing[] = {nullptr};
    pid_t id = 0;
    errno =
        posix_spawn(&id, program.c_str(), given.Get(), SpawnAttributes().Get(),
                    ExecWords(words).data(), environment == Environment::Empty ? nothing : environ);
    if (errno != 0)
        return std::nullopt;
    ChildProcess child(id, WatchProcess(id));
    if (!child.m_exit.IsOpen())
        return std::nullopt; // a child that cannot be watched must not run
    return child;
}

ChildProcess::ChildProcess(ChildProcess&& other) noexcept
    : m_id(std::exchange(other.m_id, 0)), m_exit(std::move(other.m_exit)) {}

ChildProcess::~ChildProcess() {
    if (m_id == 0)
        return;
    Kill();
    Wait();
}

void ChildProcess::Kill() const {
    if (m_id != 0)
        kill(-m_id, SIGKILL);
}

int ChildProcess::Wait() {
    int status = -1;
    if (m_id == 0)
        return status;
    while (waitpid(m_id, &status, 0) < 0) {
        if (errno != EINTR) {
            status = -1;
            break;
        }
    }
    m_id = 0;
    return status;
}

} // namespace standins
