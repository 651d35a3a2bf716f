#include "standins/distiller/inprocess/Ghostscript.h"

#include "standins/inprocess/Paths.h"

#include <unistd.h>

#include <cctype>
#include <filesystem>

namespace fs = std::filesystem;

namespace standins {

namespace {

bool IsVersion(const std::string& name) {
    return !name.empty() && std::isdigit(static_cast<unsigned char>(name[0]));
}

/// Ghostscript keeps the files of each version apart: "share/ghostscript/10.00.0". Where there is
/// more than one, nothing tells which is the program's.
std::string NameOf(const fs::path& program) {
    std::string version;
    std::error_code error;
    fs::directory_iterator entry(program.parent_path().parent_path() / "share" / "ghostscript",
                                 error);
    for (const fs::directory_iterator end; !error && entry != end; entry.increment(error)) {
        const std::string name = entry->path().filename();
        if (!IsVersion(name))
            continue;
        if (!version.empty())
            return "Ghostscript";
        version = name;
    }
    return version.empty() ? "Ghostscript" : "Ghostscript " + version;
}

} // namespace

std::optional<Ghostscript> FindGhostscript() {
    for (const std::string& folder : SearchPath()) {
        std::error_code error;
        const fs::path program = fs::canonical(fs::path(folder) / "gs", error);
        if (!error && fs::is_regular_file(program, error) && access(program.c_str(), X_OK) == 0)
            return Ghostscript{program, NameOf(program)};
    }
    return std::nullopt;
}

} // namespace standins
