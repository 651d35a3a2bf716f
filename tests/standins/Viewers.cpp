#include "tests/standins/Viewers.h"

#include <cmath>
#include <cstdio>
#include <iterator>
#include <memory>
#include <sstream>

namespace fs = std::filesystem;

namespace {

/// @param viewer a command; the file's name follows
std::string OutputOf(const std::string& viewer, const fs::path& file,
                     const std::string& furtherArguments = "") {
    const std::string command = viewer + " '" + file.string() + "' " + furtherArguments;
    const std::unique_ptr<std::FILE, int (*)(std::FILE*)> pipe(popen(command.c_str(), "r"), pclose);
    std::string output;
    for (int c = std::fgetc(pipe.get()); c != EOF; c = std::fgetc(pipe.get()))
        output += static_cast<char>(c);
    return output;
}

std::vector<std::string> Lines(const std::string& text) {
    std::istringstream stream(text);
    std::vector<std::string> lines;
    for (std::string line; std::getline(stream, line);)
        lines.push_back(line);
    return lines;
}

std::string Ghostscript(const std::string& device, const fs::path& input,
                        const std::string& output = "-") {
    return OutputOf("gs -q -dBATCH -dNOPAUSE -dSAFER -dAutoRotatePages=/None -sDEVICE=" + device +
                        " -o '" + output + "'",
                    input, "2>&1");
}

/// @param start how a line begins that has the numbers of a page
NumbersOfPages ReadNumbers(const std::string& text, const std::string& start) {
    NumbersOfPages pages;
    for (const std::string& line : Lines(text)) {
        std::array<double, 4> page{};
        if (line.rfind(start, 0) == 0 && std::sscanf(line.c_str() + start.size(), "%lf %lf %lf %lf",
                                                     &page[0], &page[1], &page[2], &page[3]) == 4)
            pages.push_back(page);
    }
    return pages;
}

} // namespace

std::string PostScriptText(const fs::path& postScript) {
    return Ghostscript("txtwrite", postScript);
}

fs::path DistilledByGhostscript(const fs::path& postScript) {
    fs::path pdf = postScript.string() + ".pdf";
    Ghostscript("pdfwrite", postScript, pdf);
    return pdf;
}

NumbersOfPages InkOf(const fs::path& postScript) {
    return ReadNumbers(Ghostscript("inkcov", postScript), "");
}

NumbersOfPages BoundsOf(const fs::path& postScript) {
    return ReadNumbers(Ghostscript("bbox", postScript), "%%BoundingBox:");
}

std::string PdfText(const fs::path& pdf) {
    const std::string text = OutputOf("pdftotext", pdf, "- 2>/dev/null");
    return text.substr(0, text.find_last_not_of("\n\f") + 1);
}

std::vector<std::string> PdfPageSizes(const fs::path& pdf) {
    std::vector<std::string> sizes;
    for (const std::string& line : Lines(OutputOf("pdfinfo -l -1", pdf))) {
        double width = 0;
        double height = 0;
        if (std::sscanf(line.c_str(), "Page %*d size: %lf x %lf", &width, &height) == 2)
            sizes.push_back(std::to_string(std::lround(width)) + "x" +
                            std::to_string(std::lround(height)));
    }
    return sizes;
}

std::map<std::string, bool> PdfFonts(const fs::path& pdf) {
    std::map<std::string, bool> fonts;
    const std::vector<std::string> lines = Lines(OutputOf("pdffonts", pdf));
    for (std::size_t i = 2; i < lines.size(); ++i) { // below the heading
        std::istringstream line(lines[i]);
        const std::vector<std::string> words(std::istream_iterator<std::string>(line), {});
        const std::string& name = words.front();
        fonts[name.substr(name.find('+') + 1)] = words.at(words.size() - 5) == "yes";
    }
    return fonts;
}

std::vector<PlacedWord> PdfWords(const fs::path& pdf) {
    std::vector<PlacedWord> words;
    int page = 0;
    for (const std::string& line : Lines(OutputOf("pdftotext -bbox", pdf, "-"))) {
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
