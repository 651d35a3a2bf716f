#include "standins/office/shared/OfficeReach.h"

#include <filesystem>

namespace standins {

Reach OfficeReach(const std::string& program, const std::vector<std::string>& fontFolders) {
    Reach reach;
    reach.readable = {std::filesystem::path(program).parent_path(), "/etc/libreoffice",
                      "/var/lib/libreoffice"};
    AllowSystem(reach);
    AllowFonts(reach, fontFolders);
    return reach;
}

} // namespace standins
