#include "tests/standins/confinement/Attempts.h"

#include <dirent.h>
#include <fcntl.h>
#include <linux/io_uring.h>
#include <netinet/in.h>
#include <sched.h>
#include <spawn.h>
#include <sys/prctl.h>
#include <sys/ptrace.h>
#include <sys/resource.h>
#include <sys/shm.h>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <sys/uio.h>
#include <sys/un.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>
#include <sstream>

namespace {

struct Targets {
    std::string folder;
    std::uint16_t port = 0;
    pid_t process = 0;
    std::string secret;
};

bool Opens(const std::string& path, int flags) {
    return open(path.c_str(), flags | O_CLOEXEC, 0600) >= 0;
}

bool ChangesMode(const std::string& path) {
    struct stat before {};
    struct stat after {};
    stat(path.c_str(), &before);
    chmod(path.c_str(), before.st_mode ^ S_IROTH);
    stat(path.c_str(), &after);
    return before.st_mode != after.st_mode;
}

bool ReachesTcp(std::uint16_t port) {
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_port = htons(port);
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    const int socket = ::socket(AF_INET, SOCK_STREAM, 0);
    return connect(socket, reinterpret_cast<sockaddr*>(&address), sizeof address) == 0;
}

sockaddr_un LocalAddress(const std::string& path) {
    sockaddr_un address{};
    address.sun_family = AF_UNIX;
    path.copy(address.sun_path, sizeof address.sun_path - 1);
    return address;
}

bool Connects(const std::string& path) {
    const sockaddr_un address = LocalAddress(path);
    const int socket = ::socket(AF_UNIX, SOCK_STREAM, 0);
    return connect(socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) == 0;
}

/// @param socket open, of any kind that is without a connection
bool Sends(int socket, const std::string& path) {
    const sockaddr_un address = LocalAddress(path);
    return sendto(socket, "x", 1, 0, reinterpret_cast<const sockaddr*>(&address), sizeof address) ==
           1;
}

bool SendsByPair(const std::string& path) {
    int ends[2] = {-1, -1};
    return socketpair(AF_UNIX, SOCK_DGRAM, 0, ends) == 0 && Sends(ends[0], path);
}

bool SetsUpRing() {
    io_uring_params parameters{};
    return syscall(SYS_io_uring_setup, 4, &parameters) >= 0;
}

/// There is nothing at the address, which alone is told to whoever may look.
bool ReadsMemory(pid_t process) {
    char byte = 0;
    const iovec here{&byte, 1};
    const iovec there{nullptr, 1};
    return process_vm_readv(process, &here, 1, &there, 1, 0) >= 0 || errno == EFAULT;
}

/// @param child answer of a call that may have made a process
bool IsChild(pid_t child) {
    if (child == 0)
        _exit(0);
    return child > 0 && waitpid(child, nullptr, 0) == child;
}

/// Of a program that is not there, which only a new process finds out.
bool Spawns() {
    char program[] = "/nonexistent";
    char* words[] = {program, nullptr};
    pid_t child = -1;
    return posix_spawn(&child, program, nullptr, nullptr, words, environ) == ENOENT;
}

bool OwnsSignals(pid_t process) {
    int ends[2] = {-1, -1};
    return socketpair(AF_UNIX, SOCK_STREAM, 0, ends) == 0 && fcntl(ends[0], F_SETOWN, process) == 0;
}

bool LimitsProcess(pid_t process) {
    rlimit limit{};
    return prlimit(process, RLIMIT_CORE, nullptr, &limit) == 0;
}

bool SendsByDescriptor(pid_t process) {
    const auto descriptor = static_cast<int>(syscall(SYS_pidfd_open, process, 0));
    return syscall(SYS_pidfd_send_signal, descriptor, 0, nullptr, 0) == 0;
}

} // namespace

std::string Attempt(const std::string& targets) {
    Targets at;
    std::istringstream(targets) >> at.folder >> at.port >> at.process;
    at.secret = at.folder + "/secret";
    const std::string proc = "/proc/" + std::to_string(at.process);
    const std::pair<const char*, bool> attempts[] = {
        {"read a file", Opens(at.secret, O_RDONLY)},
        {"read a file by another road", Opens("/proc/self/root" + at.secret, O_RDONLY)},
        {"read it by a symbolic link",
         symlink(at.secret.c_str(), "symbolic") == 0 && Opens("symbolic", O_RDONLY)},
        {"read it by a hard link", link(at.secret.c_str(), "hard") == 0},
        {"write a file", Opens(at.secret, O_WRONLY)},
        {"empty a file", truncate(at.secret.c_str(), 1) == 0},
        {"change a file's mode", ChangesMode(at.secret)},
        {"make a file", Opens(at.folder + "/new", O_WRONLY | O_CREAT)},
        {"make a file without a name", Opens(at.folder, O_WRONLY | O_TMPFILE)},
        {"list a folder", opendir(at.folder.c_str()) != nullptr},
        {"move a file", rename((at.folder + "/other").c_str(), (at.folder + "/it").c_str()) == 0},
        {"remove a file", unlink((at.folder + "/it").c_str()) == 0},
        {"read the list of users", Opens("/etc/passwd", O_RDONLY)},
        {"read another's environment", Opens(proc + "/environ", O_RDONLY)},
        {"connect by TCP", ReachesTcp(at.port)},
        {"send by UDP", socket(AF_INET, SOCK_DGRAM, 0) >= 0},
        {"ask the kernel of the network", socket(AF_NETLINK, SOCK_RAW, 0) >= 0},
        {"use io_uring", SetsUpRing()},
        {"connect to a socket", Connects(at.folder + "/stream")},
        {"send to a socket", Sends(socket(AF_UNIX, SOCK_DGRAM, 0), at.folder + "/datagrams")},
        {"send to a socket as if raw",
         Sends(socket(AF_UNIX, SOCK_RAW, 0), at.folder + "/datagrams")},
        {"send to a socket by a pair", SendsByPair(at.folder + "/datagrams")},
        {"trace a process", ptrace(PTRACE_SEIZE, at.process, nullptr, nullptr) == 0},
        {"read a process's memory", ReadsMemory(at.process)},
        {"send a signal", kill(at.process, 0) == 0},
        {"send a signal to all", kill(-1, 0) == 0},
        {"send a signal by a descriptor", SendsByDescriptor(at.process)},
        {"send a signal by a file", OwnsSignals(at.process)},
        {"see a process's limits", LimitsProcess(at.process)},
        {"share memory", shmget(IPC_PRIVATE, 1, 0600) >= 0},
        {"fork", IsChild(fork())},
        {"fork by its number", IsChild(static_cast<pid_t>(syscall(SYS_fork)))},
        {"start a program", Spawns()},
        {"outlive its supervisor", prctl(PR_SET_PDEATHSIG, 0) == 0},
    };
    std::string outcomes;
    for (const auto& [name, isThrough] : attempts)
        outcomes += name + std::string(isThrough ? ": through\n" : ": refused\n");
    return outcomes;
}
