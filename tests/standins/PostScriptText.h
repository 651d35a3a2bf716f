#pragma once

#include <filesystem>
#include <string>
#include <vector>

// What Ghostscript reads in a PostScript file.

/// The words of all pages, or of one, counted from 1.
std::string PostScriptText(const std::filesystem::path& file, int page = 0);

/// The size of each page in points, as a viewer shows it: "595x842".
std::vector<std::string> PostScriptPageSizes(const std::filesystem::path& file);
