#pragma once

#include "standins/confinement/Confinement.h"
#include "standins/office/shared/HostOrder.h"
#include "standins/shared/Channel.h"

#include <sys/types.h>

namespace standins {

/// Serves a supervisor from within LibreOffice's loop: for each order it forks a child, the
/// supervisor's own, which does the work in its work folder and ends. This process itself opens no
/// document.
class ForkServer {
public:
    /// @param supervisor this process's parent
    /// @param reach what a child may reach, but for its work folder
    ForkServer(Channel& supervisor, Reach reach);

    /// Tells the supervisor that it is ready, and serves until the supervisor has gone.
    [[noreturn]] void Serve();

private:
    void Answer(const HostOrder& order, const Descriptor& log);

    Channel& m_supervisor;
    const Reach m_reach;
    const pid_t m_parent;
};

} // namespace standins
