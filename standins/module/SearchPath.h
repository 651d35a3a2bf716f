#pragma once

#include <string>
#include <vector>

namespace standins {

/// The folders in which a shell looks for programs, in its order: those of PATH, or the usual ones
/// when it is not set.
std::vector<std::string> SearchPath();

} // namespace standins
