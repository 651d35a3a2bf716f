#pragma once

#include "host/program/base/Fault.h"
#include "host/program/system/LineChannel.h"

#include <cstdint>
#include <memory>
#include <string>
#include <vector>

/// Another process of this program, which is talked to by its stdin and stdout. It shares this
/// one's stderr, and does not outlive this one.
class ChildProcess {
public:
    /// @param arguments UTF-8, without the program's name
    /// @param fault receives why there is none
    static std::unique_ptr<ChildProcess> Start(const std::vector<std::string>& arguments,
                                               Fault& fault);

    /// Ends the process, if it has not ended, and waits for it. Nobody may read any more.
    ~ChildProcess();
    ChildProcess(const ChildProcess&) = delete;
    ChildProcess& operator=(const ChildProcess&) = delete;

    LineChannel& Channel() { return m_channel; }

    /// Ends the process at once, wherever it is. Whoever reads then reads the end.
    void Kill() const;

    /// Waits for the end.
    /// @return what the process has done, as a fault of the document that it had
    Fault Wait();

private:
    ChildProcess(std::intptr_t process, LineChannel channel)
        : m_process(process), m_channel(std::move(channel)) {}

    static constexpr std::intptr_t None = -1;

    std::intptr_t m_process; ///< the system's id or handle; None when it has been waited for
    LineChannel m_channel;
};

/// In such a process: takes over its stdin and stdout. What anything else writes to stdout goes to
/// stderr from then on, and processes that are started do not have the channel.
LineChannel TakeStandardStreams();

/// Ends this process as it is, whatever its threads are doing; nothing is tidied up.
[[noreturn]] void EndThisProcess(int exitCode);
