#pragma once

#include <string>

namespace standins {

/// The address of LibreOffice's user installation in a work folder.
std::string UserInstallationUrl(const std::string& workFolder);

/// Removes the socket that LibreOffice makes outside of its work folder and leaves behind when it
/// is killed.
void RemoveSocket(const std::string& workFolder);

} // namespace standins
