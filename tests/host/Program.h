#pragma once

#include "tests/support/TemporaryFolder.h"

#include <gmock/gmock.h>

#include <cstdint>
#include <filesystem>
#include <functional>
#include <nlohmann/json.hpp>
#include <string>
#include <vector>

using testing::HasSubstr;

/// What a program's run came to.
struct RunResult {
    int exitCode = 0; ///< where a signal ended it, minus that
    std::string out;
    std::string err;

    /// The JSON Lines of stdout; the test fails when one is none.
    std::vector<nlohmann::json> Records() const;
    /// Those of one type.
    std::vector<nlohmann::json> Records(const std::string& type) const;
};

/// A program that has been started; killed with the object unless it has been waited for.
class RunningProgram {
public:
    /// @param command the program's path and its arguments, UTF-8
    explicit RunningProgram(const std::vector<std::string>& command);
    ~RunningProgram();
    RunningProgram(const RunningProgram&) = delete;
    RunningProgram& operator=(const RunningProgram&) = delete;

    /// Asks it to end, as Ctrl-C does.
    void Interrupt() const;
    /// Asks it to end in the other way that the system has, if it has one.
    void Terminate() const;
    /// Waits until it has said that it finishes what is under way, and so taken the request in.
    void AwaitNote() const;
    /// Asks it to end, and when it has taken that in, once more.
    void InterruptTwice() const;
    RunResult Wait();
    /// Whether it has, by itself or not.
    bool HasEnded() const;

    /// What it has said so far on stderr.
    std::string Err() const { return ReadBytes(m_folder / "err"); }

private:
    static constexpr std::intptr_t None = -1;

    /// Waits until it has ended.
    int ExitCode();

    TemporaryFolder m_folder;       ///< holds its output
    std::intptr_t m_process = None; ///< the system's id or handle
};

/// Whether a process of `quillon` runs that was given the argument; where tests run one at a time,
/// any such process.
bool IsQuillonRunningWith(const std::string& argument);

RunResult RunProgram(const std::vector<std::string>& command);

/// Runs `quillon` with the scripted filter and stand-in.
RunResult RunQuillon(std::vector<std::string> arguments);

/// Takes what a stand-in entered out of the registry, where that outlives the program.
/// @param file the module without its suffix
void UnregisterStandIn(const std::string& file = TEST_STAND_INS "/ScriptedStandIn");

/// The command that RunQuillon runs.
std::vector<std::string> QuillonCommand(std::vector<std::string> arguments);

/// Waits until the condition holds; the test fails when it does not.
void Await(const std::string& what, const std::function<bool()>& condition);

/// Waits until the file exists.
void AwaitFile(const std::filesystem::path& file);
