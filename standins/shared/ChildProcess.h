#pragma once

#include "standins/shared/Descriptor.h"

#include <sys/types.h>

#include <optional>
#include <string>
#include <vector>

namespace standins {

/// Words as exec and its like want them: pointers to each, and a null.
/// @param words must outlive the answer
std::vector<char*> ExecWords(std::vector<std::string>& words);

/// What a program finds in its environment: what its parent has, or nothing.
enum class Environment { Inherited, Empty };

/// A helper program started by this process, in a session of its own: it has no terminal, and its
/// process group has its number. Killed and waited for when the object goes.
class ChildProcess {
public:
    /// Safe in a process with many threads: nothing of this process runs in the child.
    /// @param program full path
    /// @param arguments without the program's name
    /// @param descriptors what the child gets as descriptors 0, 1, 2 and so on, and nothing else
    /// that is marked to be closed
    /// @return nothing when the program cannot be started; errno tells why
    static std::optional<ChildProcess> Start(const std::string& program,
                                             const std::vector<std::string>& arguments,
                                             const std::vector<int>& descriptors,
                                             Environment environment = Environment::Inherited);

    ChildProcess(ChildProcess&& other) noexcept;
    ChildProcess& operator=(ChildProcess&&) = delete;
    ~ChildProcess();

    /// The number of the process and of its group.
    pid_t Id() const { return m_id; }
    /// Becomes readable when the process has ended.
    int ExitDescriptor() const { return m_exit.Get(); }

    /// Kills the whole process group.
    void Kill() const;
    /// Waits for the end.
    /// @return the status as waitpid gives it; -1 when somebody else in this process has waited
    int Wait();

private:
    ChildProcess(pid_t id, Descriptor exit) : m_id(id), m_exit(std::move(exit)) {}

    pid_t m_id;
    Descriptor m_exit; ///< a pidfd
};

} // namespace standins
