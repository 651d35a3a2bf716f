#include "tests/host/Program.h"

#include <fcntl.h>
#include <gtest/gtest.h>
#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <fstream>

RunningProgram::RunningProgram(const std::vector<std::string>& command) {
    const std::filesystem::path out = m_folder / "out";
    const std::filesystem::path err = m_folder / "err";
    std::vector<char*> arguments;
    arguments.reserve(command.size() + 1);
    for (const std::string& argument : command)
        arguments.push_back(const_cast<char*>(argument.c_str()));
    arguments.push_back(nullptr);
    posix_spawn_file_actions_t actions = {};
    posix_spawn_file_actions_init(&actions);
    posix_spawn_file_actions_addopen(&actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
    posix_spawn_file_actions_addopen(&actions, STDOUT_FILENO, out.c_str(),
                                     O_WRONLY | O_CREAT | O_APPEND, 0600);
    posix_spawn_file_actions_addopen(&actions, STDERR_FILENO, err.c_str(),
                                     O_WRONLY | O_CREAT | O_APPEND, 0600);
    pid_t process = -1;
    const int error =
        posix_spawn(&process, arguments[0], &actions, nullptr, arguments.data(), environ);
    posix_spawn_file_actions_destroy(&actions);
    EXPECT_EQ(error, 0) << command[0];
    m_process = error == 0 ? process : None;
}

RunningProgram::~RunningProgram() {
    if (m_process == None)
        return;
    kill(static_cast<pid_t>(m_process), SIGKILL);
    waitpid(static_cast<pid_t>(m_process), nullptr, 0);
}

void RunningProgram::Interrupt() const {
    kill(static_cast<pid_t>(m_process), SIGINT);
}

void RunningProgram::Terminate() const {
    kill(static_cast<pid_t>(m_process), SIGTERM);
}

bool RunningProgram::HasEnded() const {
    siginfo_t ended = {};
    return waitid(P_PID, static_cast<id_t>(m_process), &ended, WEXITED | WNOHANG | WNOWAIT) == 0 &&
           ended.si_pid != 0;
}

int RunningProgram::ExitCode() {
    int status = 0;
    waitpid(static_cast<pid_t>(m_process), &status, 0);
    m_process = None;
    return WIFEXITED(status) ? WEXITSTATUS(status) : -WTERMSIG(status);
}

bool IsQuillonRunningWith(const std::string& argument) {
    std::error_code error;
    for (const auto& process : std::filesystem::directory_iterator("/proc", error)) {
        std::ifstream commandLine(process.path() / "cmdline", std::ios::binary);
        for (std::string each; std::getline(commandLine, each, '\0');)
            if (each == argument)
                return true;
    }
    return false;
}
