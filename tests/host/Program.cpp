#include "tests/host/Program.h"

#include "tests/support/TemporaryFolder.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <chrono>
#include <csignal>
#include <sstream>
#include <thread>

namespace fs = std::filesystem;

namespace {

pid_t Spawn(const std::vector<std::string>& command, const fs::path& folder) {
    std::vector<char*> arguments;
    arguments.reserve(command.size() + 1);
    for (const std::string& argument : command)
        arguments.push_back(const_cast<char*>(argument.c_str()));
    arguments.push_back(nullptr);
    posix_spawn_file_actions_t actions = {};
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
    posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, (folder / "out").c_str(),
                                     O_WRONLY | O_CREAT | O_APPEND, 0600);
    posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, (folder / "err").c_str(),
                                     O_WRONLY | O_CREAT | O_APPEND, 0600);
    pid_t process = -1;
    const int error =
        posix_spawn(&process, arguments[0], &actions, nullptr, arguments.data(), environ);
    posix_spawn_file_actions_destroy(&actions);
    EXPECT_EQ(error, 0) << command[0];
    return error == 0 ? process : -1;
}

fs::path NewFolder() {
    std::string name = (fs::temp_directory_path() / "quillon-run-XXXXXX").string();
    EXPECT_NE(mkdtemp(name.data()), nullptr);
    return name;
}

} // namespace

std::vector<nlohmann::json> RunResult::Records() const {
    std::vector<nlohmann::json> records;
    std::istringstream lines(out);
    for (std::string line; std::getline(lines, line);) {
        records.push_back(nlohmann::json::parse(line, nullptr, false));
        EXPECT_TRUE(records.back().is_object()) << line;
    }
    return records;
}

std::vector<nlohmann::json> RunResult::Records(const std::string& type) const {
    std::vector<nlohmann::json> records;
    for (nlohmann::json& record : Records())
        if (record.value("type", "") == type)
            records.push_back(std::move(record));
    return records;
}

RunningProgram::RunningProgram(const std::vector<std::string>& command) : m_folder(NewFolder()) {
    m_process = Spawn(command, m_folder);
}

RunningProgram::~RunningProgram() {
    if (m_process > 0) {
        Signal(SIGKILL);
        waitpid(m_process, nullptr, 0);
    }
    std::error_code ignored;
    fs::remove_all(m_folder, ignored);
}

void RunningProgram::Signal(int signal) const {
    kill(m_process, signal);
}

RunResult RunningProgram::Wait() {
    int status = 0;
    waitpid(m_process, &status, 0);
    m_process = -1;
    return {WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status),
            ReadBytes(m_folder / "out"), ReadBytes(m_folder / "err")};
}

RunResult RunProgram(const std::vector<std::string>& command) {
    return RunningProgram(command).Wait();
}

std::vector<std::string> QuillonCommand(std::vector<std::string> arguments) {
    arguments.insert(arguments.begin(),
                     {QUILLON_PROGRAM, "--filters", TEST_FILTERS, "--stand-ins", TEST_STAND_INS});
    return arguments;
}

RunResult RunQuillon(std::vector<std::string> arguments) {
    return RunProgram(QuillonCommand(std::move(arguments)));
}

void AwaitFile(const fs::path& file) {
    using namespace std::chrono;
    const auto end = steady_clock::now() + seconds(20);
    while (!fs::exists(file) && steady_clock::now() < end)
        std::this_thread::sleep_for(milliseconds(5));
    ASSERT_TRUE(fs::exists(file)) << file;
}
