#pragma once

#include <optional>
#include <string>

namespace standins {

/// Ghostscript as it is installed on this machine.
struct Ghostscript {
    std::string program; ///< its full path
    std::string name; ///< for people, with its version if that can be told: "Ghostscript 10.00.0"
};

/// Looks for Ghostscript as a shell would, by `gs` and PATH, and learns its version from the name
/// of its folder of resources: nothing is started.
std::optional<Ghostscript> FindGhostscript();

} // namespace standins
