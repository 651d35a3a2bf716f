#include "standins/office/engine/TextLibrary.h"

#include <unistd.h>

#include <filesystem>

namespace fs = std::filesystem;

namespace standins {

std::string TextLibraryPath() {
    std::error_code error;
    return fs::read_symlink("/proc/self/exe", error).parent_path() / "office-text";
}

bool LinkTextLibrary(const std::string& folder) {
    return symlink(TextLibraryPath().c_str(), (fs::path(folder) / TextLibraryLink).c_str()) == 0;
}

} // namespace standins
