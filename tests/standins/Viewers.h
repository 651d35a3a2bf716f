#pragma once

#include <array>
#include <filesystem>
#include <map>
#include <string>
#include <vector>

// What Ghostscript sees in PostScript files.

std::string PostScriptText(const std::filesystem::path& postScript);

/// Makes a PDF file beside the PostScript file, with the same pages.
std::filesystem::path DistilledByGhostscript(const std::filesystem::path& postScript);

/// Four numbers for each page.
using NumbersOfPages = std::vector<std::array<double, 4>>;

/// What part of each page is cyan, magenta, yellow and black.
NumbersOfPages InkOf(const std::filesystem::path& postScript);

/// The edges of what is drawn on each page, in points: left, bottom, right, top.
NumbersOfPages BoundsOf(const std::filesystem::path& postScript);

// What Poppler sees in PDF files; nothing where there is none.

/// The words of all pages, without the space at the end.
std::string PdfText(const std::filesystem::path& pdf);

/// The size of each page in points: "595x842".
std::vector<std::string> PdfPageSizes(const std::filesystem::path& pdf);

/// Each font by its name, without a subset's prefix, and whether it is embedded.
std::map<std::string, bool> PdfFonts(const std::filesystem::path& pdf);

/// A word on a page, and where it begins, in points from the page's top left corner.
struct PlacedWord {
    int page; ///< counted from 1
    double x;
    double y;
    std::string text;
};

std::vector<PlacedWord> PdfWords(const std::filesystem::path& pdf);
