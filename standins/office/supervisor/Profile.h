#pragma once

#include <string>

namespace standins {

/// Makes the profile that LibreOffice finds in a work folder: with it, LibreOffice does not set
/// itself up, runs no macro, and fetches nothing that a document links to.
/// @param program LibreOffice's program folder
/// @return false when it cannot be written; errno tells why
bool MakeProfile(const std::string& folder, const std::string& program);

} // namespace standins
