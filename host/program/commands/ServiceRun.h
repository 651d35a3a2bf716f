#pragma once

#include "host/program/commands/Command.h"
#include "host/program/watch/WatchService.h"

/// What the command line of a service says, whichever it is.
struct ServiceOptions {
    std::optional<std::string> configuration; ///< a file
    std::optional<std::string> queue;
    std::optional<std::string> http;
    std::optional<unsigned> jobs;
};

/// Puts a command line's word in the place of a file's.
void Override(WatchConfiguration& configuration, const ServiceOptions& options);

/// A watch, or what works for others' watches, as a command line asks for it.
struct ServiceRun {
    WatchConfiguration configuration;
    WatchService::Means means; ///< but what the common options say
    bool finds = true;         ///< documents in folders; otherwise it works on what others find
    bool anyVersion = false;   ///< also next to machines whose pages may look another way
    bool pageIsAsked = false;  ///< the run is in vain without the page
    bool obeysHangUp = false;  ///< reads the configuration anew then
};

/// Runs it until it is asked to end.
/// @return see WatchService::Run; the code of what is missing before it can begin
ExitCode RunService(ServiceRun run, const CommonOptions& options, Reporter& reporter);
