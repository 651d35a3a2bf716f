#pragma once

#include "standins/shared/Channel.h"
#include "standins/shared/Clocks.h"

#include <CLI/CLI.hpp>
#include <cstdint>
#include <string>
#include <vector>

namespace standins {

/// A supervisor is started with the channel to its server as descriptor 3; what else it is given
/// follows from here on.
constexpr int FirstGivenDescriptor = 4;

/// What every supervisor finds on its command line.
struct SupervisorOptions {
    std::string folder; ///< the work folder, not made yet
    std::vector<std::string> fontFolders;
    long stallSeconds = 0;
    long totalSeconds = 0;
    std::uint64_t mostMemory = 0; ///< for the document, in bytes

    void AddTo(CLI::App& options);
    TimeLimits Limits() const;
};

/// Makes the calling process a supervisor: it keeps nothing but what it was given, ends with its
/// server and not by signals, and ends what it starts.
/// @param given how many descriptors it got beside the channel
/// @param mostMemory its own, in bytes; no engine of its gets more
/// @return the channel to the server
Channel BecomeSupervisor(int given, std::uint64_t mostMemory);

} // namespace standins
