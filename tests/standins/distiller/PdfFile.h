#pragma once

#include <filesystem>
#include <map>
#include <string>

/// What a PDF file is like, as its readers see it.
struct PdfFile {
    std::string version; ///< "1.4"; empty when it cannot be read
    int pages = 0;
    std::string text;                          ///< of all pages
    std::map<std::string, bool> embeddedFonts; ///< each font by its name, without a subset's prefix
    int pictureWidth = 0;                      ///< of the last picture, in pixels
};

PdfFile ReadPdf(const std::filesystem::path& path);
