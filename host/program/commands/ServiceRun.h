#pragma once

#include "host/program/commands/Command.h"
#include "host/program/watch/WatchService.h"

/// A watch, or what works for others' watches, as a command line asks for it.
struct ServiceRun {
    WatchConfiguration configuration;
    WatchService::Means means;
    bool finds = true;        ///< documents in folders; otherwise it works on what others find
    bool anyVersion = false;  ///< also next to machines whose pages may look another way
    bool pageIsAsked = false; ///< the run is in vain without the page
    bool obeysHangUp = false; ///< reads the configuration anew then
};

/// Runs it until it is asked to end.
/// @return see WatchService::Run; the code of what is missing before it can begin
ExitCode RunService(ServiceRun run, const FilterSet& filters, Reporter& reporter);

/// What the common options say of a service.
WatchService::Means MeansOf(const CommonOptions& options);
