#include "tests/standins/PostScriptText.h"

#include <gtest/gtest.h>

#include <array>
#include <cstdio>
#include <memory>
#include <sstream>

namespace {

std::string OutputOf(const std::string& command) {
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> pipe(popen(command.c_str(), "r"), pclose);
    std::string output;
    std::array<char, 4096> buffer{};
    while (const std::size_t size = std::fread(buffer.data(), 1, buffer.size(), pipe.get()))
        output.append(buffer.data(), size);
    return output;
}

const std::string Ghostscript = "gs -q -dBATCH -dNOPAUSE -dSAFER -sDEVICE=";

} // namespace

std::string PostScriptText(const std::filesystem::path& file, int page) {
    const std::string pages = page > 0 ? " -sPageList=" + std::to_string(page) : "";
    return OutputOf(Ghostscript + "txtwrite -o -" + pages + " '" + file.string() + "'");
}

std::vector<std::string> PostScriptPageSizes(const std::filesystem::path& file) {
    // One pixel a point; the picture's header says how many.
    std::istringstream pictures(OutputOf(Ghostscript + "pbmraw -r72 -o - '" + file.string() + "'"));
    std::vector<std::string> sizes;
    for (std::string magic; pictures >> magic && magic == "P4";) {
        std::string comment;
        pictures >> std::ws;
        while (pictures.peek() == '#')
            std::getline(pictures, comment) >> std::ws;
        int width = 0;
        int height = 0;
        pictures >> width >> height;
        sizes.push_back(std::to_string(width) + "x" + std::to_string(height));
        pictures.ignore(1 + (width + 7) / 8 * height);
    }
    return sizes;
}
