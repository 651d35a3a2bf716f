#pragma once

#include "standins/confinement/ResourceLimits.h"
#include "standins/process/Clocks.h"

#include <string>

namespace standins {

/// What the machine, or whoever started the program, allows less of than an engine may use. To be
/// asked when one has failed: most documents need far less, and come out all the same.
/// @return "only 20 files may be open (ulimit -n)"; empty when there is enough of everything
std::string DescribeTightLimit(const ResourceLimits& wanted, TimeLimits times);

} // namespace standins
