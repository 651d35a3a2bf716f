// A program in an engine's place, which writes the outcomes of its attempts where that engine's
// output belongs: in what looks like a PDF. Under a name of its own it takes the targets from its
// command line and writes to its standard output.

#include "tests/standins/confinement/Attempts.h"

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>

namespace fs = std::filesystem;

namespace {

void Write(const std::string& path, const std::string& targets) {
    const std::string outcomes = Attempt(targets);
    std::ofstream(path) << "%PDF-\n" << outcomes << "%%EOF\n";
}

std::string ReadTargets(const fs::path& program) {
    std::ifstream file(program.parent_path() / "../lib/targets");
    return {std::istreambuf_iterator<char>(file), {}};
}

} // namespace

int main(int argc, char** argv) {
    const fs::path program = argv[0];
    if (program.filename() == "soffice.bin")
        Write("document.pdf", ReadTargets(program));
    else if (program.filename() == "gs")
        Write("/dev/fd/4", ReadTargets(program));
    else if (argc == 2)
        Write("/dev/stdout", argv[1]);
    std::_Exit(EXIT_SUCCESS); // sanitizers would look for leaks by another process
}
