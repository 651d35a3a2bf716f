#pragma once

#include <array>
#include <filesystem>
#include <string>
#include <vector>

// What Ghostscript reads in a PostScript file.

/// The words of all pages, or of one, counted from 1.
std::string PostScriptText(const std::filesystem::path& file, int page = 0);

/// The size of each page in points, as a viewer shows it: "595x842".
std::vector<std::string> PostScriptPageSizes(const std::filesystem::path& file);

/// A word on a page, and where it begins, in points from the page's top left corner.
struct PrintedWord {
    int page; ///< counted from 1
    double x;
    double y;
    std::string text;
};

std::vector<PrintedWord> PostScriptWords(const std::filesystem::path& file);

/// The ink of each page: what part of it is cyan, magenta, yellow and black.
std::vector<std::array<double, 4>> PostScriptInk(const std::filesystem::path& file);

/// What is drawn on a page, counted from 1: "left bottom right top", in points.
std::string PostScriptBounds(const std::filesystem::path& file, int page);
