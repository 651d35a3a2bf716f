#include "tests/standins/Processes.h"

#include <algorithm>
#include <fstream>
#include <sstream>
#include <thread>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

struct Process {
    pid_t id;
    std::string commandLine; // each word with a terminating zero
    std::string environment; // likewise
};

std::string Read(const fs::path& path) {
    std::ostringstream text;
    text << std::ifstream(path, std::ios::binary).rdbuf();
    return text.str();
}

std::vector<Process> RunningProcesses() {
    std::vector<Process> processes;
    std::error_code error;
    for (const fs::directory_entry& entry : fs::directory_iterator("/proc", error)) {
        const std::string name = entry.path().filename();
        if (std::all_of(name.begin(), name.end(), [](char c) { return c >= '0' && c <= '9'; }))
            processes.push_back(
                {std::stoi(name), Read(entry.path() / "cmdline"), Read(entry.path() / "environ")});
    }
    return processes;
}

bool IsEngine(const Process& process, const fs::path& temporary) {
    return process.environment.find("HOME=" + temporary.string()) != std::string::npos;
}

bool IsSupervisor(const Process& process, const fs::path& temporary) {
    return process.commandLine.find("--folder=" + temporary.string()) != std::string::npos;
}

pid_t Find(const fs::path& temporary, bool (*matches)(const Process&, const fs::path&)) {
    for (const Process& process : RunningProcesses()) {
        if (matches(process, temporary))
            return process.id;
    }
    return 0;
}

} // namespace

std::vector<pid_t> ProcessesOf(const fs::path& temporary) {
    std::vector<pid_t> found;
    for (const Process& process : RunningProcesses()) {
        if (IsEngine(process, temporary) || IsSupervisor(process, temporary))
            found.push_back(process.id);
    }
    return found;
}

std::string LeftoversOf(const fs::path& temporary, const fs::path& files) {
    const auto begins = [](const fs::directory_entry& entry, const char* with) {
        return entry.path().filename().string().rfind(with, 0) == 0;
    };
    std::string found;
    for (const fs::directory_entry& entry : fs::directory_iterator(temporary)) {
        if (!begins(entry, "quillon-test-")) // that is the test's own
            found += "file " + entry.path().string() + "\n";
    }
    for (const fs::directory_entry& entry : fs::recursive_directory_iterator(files)) {
        if (begins(entry, ".quillon-"))
            found += "file " + entry.path().string() + "\n";
    }
    for (const pid_t process : ProcessesOf(temporary))
        found += "process " + std::to_string(process) + "\n";
    return found;
}

pid_t AwaitEngine(const fs::path& temporary) {
    pid_t engine = 0;
    Await([&] { return (engine = Find(temporary, IsEngine)) != 0; });
    return engine;
}

pid_t AwaitSupervisor(const fs::path& temporary) {
    return AwaitEngine(temporary) ? Find(temporary, IsSupervisor) : 0;
}

bool Await(const std::function<bool()>& condition, std::chrono::milliseconds patience) {
    const auto end = std::chrono::steady_clock::now() + patience;
    while (!condition()) {
        if (std::chrono::steady_clock::now() > end)
            return false;
        std::this_thread::sleep_for(2ms);
    }
    return true;
}

std::set<std::string> SocketsOfKilledEngines() {
    std::set<std::string> found;
    for (const fs::directory_entry& entry : fs::directory_iterator("/tmp")) {
        if (entry.path().filename().string().rfind("OSL_PIPE_", 0) == 0)
            found.insert(entry.path());
    }
    const std::string alive = Read("/proc/net/unix");
    for (auto socket = found.begin(); socket != found.end();) {
        const bool isLeft = alive.find(*socket) == std::string::npos && fs::exists(*socket);
        socket = isLeft ? std::next(socket) : found.erase(socket);
    }
    return found;
}
