#include "tests/standins/Processes.h"

#include <cctype>
#include <chrono>
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
