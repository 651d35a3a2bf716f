#include "standins/office/inprocess/LibreOffice.h"

#include "standins/inprocess/Paths.h"

#include <glib.h>
#include <unistd.h>

#include <algorithm>
#include <filesystem>
#include <memory>
#include <string_view>

namespace fs = std::filesystem;

namespace standins {

namespace {

std::optional<fs::path> ProgramFolder() {
    for (const std::string& folder : SearchPath()) {
        std::error_code error;
        const fs::path launcher = fs::canonical(fs::path(folder) / "soffice", error);
        if (error)
            continue;
        const fs::path program = launcher.parent_path();
        if (access((program / "soffice.bin").c_str(), X_OK) == 0)
            return program;
    }
    return std::nullopt;
}

/// The value that stands last under a name in one of LibreOffice's settings files: the first may be
/// the description of the setting, with an empty value.
std::string LastValue(std::string_view settings, const std::string& name) {
    constexpr std::string_view Opening = "<value>";
    const std::size_t found = settings.rfind("oor:name=\"" + name + '"');
    const std::size_t opening = settings.find(Opening, found);
    if (found == std::string::npos || opening == std::string::npos)
        return {};
    const std::size_t start = opening + Opening.size();
    return std::string(settings.substr(start, settings.find('<', start) - start));
}

/// Every LibreOffice says its version in its main settings file, for its About box. The file has
/// megabytes and is looked into at each start of a client, so it is mapped and not read.
std::string NameOf(const fs::path& program) {
    const fs::path path = program.parent_path() / "share" / "registry" / "main.xcd";
    const std::unique_ptr<GMappedFile, decltype(&g_mapped_file_unref)> file(
        g_mapped_file_new(path.c_str(), FALSE, nullptr), g_mapped_file_unref);
    if (!file || g_mapped_file_get_length(file.get()) == 0)
        return "LibreOffice";
    const std::string_view settings(g_mapped_file_get_contents(file.get()),
                                    g_mapped_file_get_length(file.get()));
    const std::string version = LastValue(settings, "ooSetupVersionAboutBox");
    return version.empty() ? "LibreOffice" : "LibreOffice " + version;
}

} // namespace

bool LibreOffice::HasAll(const std::vector<const char*>& libraries) const {
    return std::all_of(libraries.begin(), libraries.end(), [&](const char* library) {
        return access((fs::path(program) / library).c_str(), R_OK) == 0;
    });
}

std::optional<LibreOffice> FindLibreOffice() {
    const std::optional<fs::path> program = ProgramFolder();
    if (!program)
        return std::nullopt;
    return LibreOffice{*program, NameOf(*program)};
}

} // namespace standins
