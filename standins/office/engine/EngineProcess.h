#pragma once

#include "standins/office/engine/EngineJob.h"
#include "standins/process/Descriptor.h"
#include "standins/process/WorkFolder.h"

#include <sys/types.h>

#include <string>

namespace standins {

// The files of a work folder.
std::string DocumentPath(const WorkFolder& folder, const EngineJob& job);
std::string PdfPath(const WorkFolder& folder);
std::string LogPath(const WorkFolder& folder);

/// The exit code, as a shell has it, of an engine that could not be started.
constexpr int EngineCannotStart = 127;

/// LibreOffice at work on one document: in a process group of its own, with limits on its memory,
/// its CPU time and the size of its files, without a network, without the caller's environment. It
/// dies with the caller.
class EngineProcess {
public:
    /// Starts it. The caller must have a single thread.
    EngineProcess(const WorkFolder& folder, const EngineJob& job);

    bool IsStarted() const { return m_exit.IsOpen(); }
    pid_t Group() const { return m_id; }
    /// Becomes readable when LibreOffice has ended.
    int ExitDescriptor() const { return m_exit.Get(); }
    /// Ends LibreOffice if it has not ended, with everything that it started.
    /// @return the status as waitpid gives it
    int End();

private:
    pid_t m_id = -1;
    Descriptor m_exit; ///< a pidfd
};

} // namespace standins
