#pragma once

#include <string>
#include <vector>

namespace standins {

/// The address of LibreOffice's user installation in a work folder.
std::string UserInstallationUrl(const std::string& workFolder);

/// The folders of which LibreOffice chooses one for the socket by which a second start with the
/// same profile would find the first.
std::vector<std::string> SocketFolders();

/// Removes that socket. It lies outside of the work folder, and LibreOffice may not.
void RemoveSocket(const std::string& workFolder);

} // namespace standins
