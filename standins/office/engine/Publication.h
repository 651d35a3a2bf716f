#pragma once

#include <string>

namespace standins {

/// Whether a file can be a publication of Publisher: a compound file with a stream of that kind.
/// LibreOffice would open anything else as a text, or as what it finds it to be.
bool IsPublication(const std::string& path);

} // namespace standins
