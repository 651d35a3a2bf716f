#pragma once

#include <string>
#include <vector>

namespace standins {

/// The folders in which a shell looks for programs, in its order.
std::vector<std::string> SearchPath();

} // namespace standins
