#include "tests/standins/Processes.h"

#include <poll.h>
#include <sys/syscall.h>
#include <unistd.h>

#include <algorithm>
#include <cctype>
#include <chrono>
#include <csignal>
#include <fstream>
#include <sstream>
#include <thread>

namespace fs = std::filesystem;
using namespace std::chrono_literals;

namespace {

std::string Read(const fs::path& path) {
    std::ostringstream text;
    text << std::ifstream(path, std::ios::binary).rdbuf();
    return text.str();
}

/// @param file what the system tells of each process: "cmdline" or "environ"
std::vector<pid_t> ProcessesWith(const std::string& text, const char* file) {
    std::vector<pid_t> found;
    for (const fs::directory_entry& entry : fs::directory_iterator("/proc")) {
        const std::string name = entry.path().filename();
        const bool isProcess = std::isdigit(static_cast<unsigned char>(name[0])) != 0;
        if (isProcess && Read(entry.path() / file).find(text) != std::string::npos)
            found.push_back(std::stoi(name));
    }
    return found;
}

} // namespace

std::vector<pid_t> EnginesIn(const fs::path& temporary) {
    return ProcessesWith("HOME=" + temporary.string(), "environ");
}

std::vector<pid_t> EnginesIn(const fs::path& temporary, const std::string& name) {
    std::vector<pid_t> engines = EnginesIn(temporary);
    const auto others = std::remove_if(engines.begin(), engines.end(), [&](pid_t engine) {
        return Read("/proc/" + std::to_string(engine) + "/comm") != name + "\n";
    });
    engines.erase(others, engines.end());
    return engines;
}

void EndForCertain(pid_t process) {
    const auto end = static_cast<int>(syscall(SYS_pidfd_open, process, 0));
    kill(process, SIGKILL);
    pollfd event{end, POLLIN, 0};
    poll(&event, 1, 10'000);
    close(end);
}

std::vector<pid_t> SupervisorsIn(const fs::path& temporary) {
    return ProcessesWith("--folder=" + temporary.string(), "cmdline");
}

std::set<std::string> AbandonedSockets() {
    std::set<std::string> found;
    for (const fs::directory_entry& entry : fs::directory_iterator("/tmp")) {
        const std::string path = entry.path();
        if (path.rfind("/tmp/OSL_PIPE_", 0) == 0 &&
            Read("/proc/net/unix").find(path) == std::string::npos)
            found.insert(path);
    }
    return found;
}

bool Await(const std::function<bool()>& condition) {
    const auto end = std::chrono::steady_clock::now() + 10s;
    while (!condition()) {
        if (std::chrono::steady_clock::now() > end)
            return false;
        std::this_thread::sleep_for(2ms);
    }
    return true;
}
