#pragma once

#include "standins/confinement/Confinement.h"

#include <string>
#include <vector>

namespace standins {

/// What LibreOffice needs within its reach, but for its work folder.
/// @param program its program folder
/// @param fontFolders as fontconfig knows them
Reach OfficeReach(const std::string& program, const std::vector<std::string>& fontFolders);

} // namespace standins
