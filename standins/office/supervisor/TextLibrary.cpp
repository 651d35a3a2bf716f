#include "standins/office/supervisor/TextLibrary.h"

#include "standins/shared/FileBytes.h"

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

bool FindsCopies(const std::string& program) {
    using namespace std::string_literals;
    constexpr std::size_t LongEnough = std::size_t{2} << 20;
    const std::string library = ReadText(program + "/libuno_sal.so.3", LongEnough);
    return library.find("lstat\0"s) != std::string::npos &&
           library.find("open64\0"s) == std::string::npos;
}

} // namespace standins
