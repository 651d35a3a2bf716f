#pragma once

#include <cstdint>
#include <filesystem>
#include <string>
#include <vector>

/// A process of a program, killed with the object.
class Process {
public:
    /// @param command the program's path and its arguments, UTF-8
    /// @param out receives stdout; a new file
    /// @param err receives stderr; a new file
    Process(const std::vector<std::string>& command, const std::filesystem::path& out,
            const std::filesystem::path& err);
    ~Process();
    Process(const Process&) = delete;
    Process& operator=(const Process&) = delete;

    /// Asks it to end, as Ctrl-C does.
    void Interrupt() const;

    /// Asks it to end in the other way that the system has, if it has one.
    void Terminate() const;

    /// @return the exit code; where a signal ended it, minus that
    int Wait();

private:
    static constexpr std::intptr_t None = -1;

    std::intptr_t m_process = None; ///< the system's id or handle
};

/// Whether a process of `quillon` runs that was given the argument; where tests run one at a time,
/// any such process.
bool IsQuillonRunningWith(const std::string& argument);
