#pragma once

#include "standins/office/shared/HostOrder.h"
#include "standins/shared/Channel.h"
#include "standins/shared/WorkFolder.h"
#include "standins/supervisor/EngineProcess.h"

#include <optional>
#include <string>

namespace standins {

/// How a supervisor keeps LibreOffice started.
struct HostSettings {
    std::string program; ///< LibreOffice's program folder
    std::string folder;  ///< its work folder, not made yet; those of the documents lie beside it
    std::vector<std::string> fontFolders;
    TimeLimits limits{};          ///< those of a document
    std::uint64_t mostMemory = 0; ///< that of a document, in bytes
    int mostDocuments = 1; ///< until LibreOffice is started anew; 0 to try whether it can be kept
};

/// The LibreOffice that a supervisor keeps started, in a process that forks a child for each
/// document. The process is replaced when it ends, does not respond, has served for long or has
/// grown; when that does not help, it is done without.
class OfficeHost {
public:
    explicit OfficeHost(HostSettings settings);
    ~OfficeHost();
    OfficeHost(const OfficeHost&) = delete;
    OfficeHost& operator=(const OfficeHost&) = delete;

    /// Starts the process unless there is one. Does not wait until it is ready.
    void Start();

    /// Waits until the process is ready.
    /// @param server is told that the work goes on; when it goes, the waiting is over
    /// @return false when it cannot be had; Reason() tells why
    bool AwaitReady(const Channel& server);

    /// Has a child forked, an engine at work. Its End() must spare Process().
    /// @param log where its messages go
    /// @param server as for AwaitReady
    /// @return nothing when it cannot be had; Reason() tells why
    std::optional<EngineProcess> Fork(const HostOrder& order, int log, const Channel& server);

    /// Replaces the process if its time has come. To be called when no child is at work.
    void RenewIfDue();

    /// 0 when there is none
    pid_t Process() const { return m_process ? m_process->Group() : 0; }
    const std::string& Reason() const { return m_reason; }

private:
    std::optional<Message> Await(const Channel& server);
    std::optional<EngineProcess> Fail(std::string reason);
    void End();

    const HostSettings m_settings;
    std::optional<WorkFolder> m_folder;
    std::optional<EngineProcess> m_process;
    std::optional<Channel> m_channel; ///< to the process
    bool m_isReady = false;
    int m_served = 0;   ///< documents
    int m_failures = 0; ///< in a row
    std::string m_reason;
};

} // namespace standins
