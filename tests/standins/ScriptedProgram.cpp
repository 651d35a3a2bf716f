#include "tests/standins/ScriptedProgram.h"

#include <fstream>

namespace fs = std::filesystem;

void WriteScriptedProgram(const fs::path& path, const fs::path& tools, const std::string& script) {
    for (const char* tool : {"sh", "sleep", "ln", "mkfifo", "truncate"})
        fs::copy_file(fs::path("/bin") / tool, tools / tool, fs::copy_options::skip_existing);
    std::ofstream(path) << "#!" << (tools / "sh").string() << "\nPATH='" << tools.string() << "'\n"
                        << script << "\n";
    fs::permissions(path, fs::perms::owner_all);
}
