#pragma once

#include <optional>
#include <string>
#include <vector>

namespace standins {

/// LibreOffice as it is installed on this machine.
struct LibreOffice {
    std::string program; ///< its program folder
    std::string name;    ///< for people, with its version: "LibreOffice 7.4.7.2"

    /// Whether its program folder holds these libraries, for instance "libswlo.so".
    bool HasAll(const std::vector<const char*>& libraries) const;
};

/// Looks for LibreOffice as a shell would, by `soffice` and PATH, and learns its version from its
/// own files: nothing is started.
std::optional<LibreOffice> FindLibreOffice();

} // namespace standins
