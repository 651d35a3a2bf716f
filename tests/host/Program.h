#pragma once

#include <sys/types.h>

#include <filesystem>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

/// What a program's run came to.
struct RunResult {
    int exitCode = 0; ///< minus the signal that ended it
    std::string out;
    std::string err;

    /// The JSON Lines of stdout; the test fails when one is none.
    std::vector<nlohmann::json> Records() const;
    /// Those of one type.
    std::vector<nlohmann::json> Records(const std::string& type) const;
};

/// A program that has been started and not yet waited for.
class RunningProgram {
public:
    /// @param command the program's path and its arguments
    explicit RunningProgram(const std::vector<std::string>& command);
    ~RunningProgram();
    RunningProgram(const RunningProgram&) = delete;
    RunningProgram& operator=(const RunningProgram&) = delete;

    void Signal(int signal) const;
    RunResult Wait();

private:
    pid_t m_process = -1;
    std::filesystem::path m_folder; ///< holds its output
};

RunResult RunProgram(const std::vector<std::string>& command);

/// Runs `quillon` with the scripted filter and stand-in.
RunResult RunQuillon(std::vector<std::string> arguments);

/// The command that RunQuillon runs.
std::vector<std::string> QuillonCommand(std::vector<std::string> arguments);

/// Waits until the file exists; the test fails when it does not appear.
void AwaitFile(const std::filesystem::path& file);
