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

std::vector<PrintedWord> PostScriptWords(const std::filesystem::path& file) {
    std::istringstream lines(
        OutputOf(Ghostscript + "pdfwrite -o - '" + file.string() + "' | pdftotext -bbox - - 2>&1"));
    std::vector<PrintedWord> words;
    int page = 0;
    for (std::string line; std::getline(lines, line);) {
        page += line.find("<page ") != std::string::npos ? 1 : 0;
        double x = 0;
        double y = 0;
        std::array<char, 256> text{};
        if (std::sscanf(line.c_str(), R"( <word xMin="%lf" yMin="%lf" %*[^>]>%255[^<])", &x, &y,
                        text.data()) == 3)
            words.push_back({page, x, y, text.data()});
    }
    return words;
}

std::vector<std::array<double, 4>> PostScriptInk(const std::filesystem::path& file) {
    std::istringstream lines(OutputOf(Ghostscript + "inkcov -o - '" + file.string() + "'"));
    std::vector<std::array<double, 4>> pages;
    std::array<double, 4> ink{};
    for (std::string rest; lines >> ink[0] >> ink[1] >> ink[2] >> ink[3];) {
        std::getline(lines, rest);
        pages.push_back(ink);
    }
    return pages;
}

std::string PostScriptBounds(const std::filesystem::path& file, int page) {
    std::istringstream lines(OutputOf(Ghostscript + "bbox -sPageList=" + std::to_string(page) +
                                      " '" + file.string() + "' 2>&1"));
    std::string keyword;
    std::string bounds;
    lines >> keyword >> std::ws;
    std::getline(lines, bounds);
    return bounds;
}
