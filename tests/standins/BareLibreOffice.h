#pragma once

#include <filesystem>
#include <string>

/// Lets LibreOffice itself convert a document, without the stand-ins and with its own settings.
/// @param format what --convert-to takes: "doc:MS Word 97"
/// @return the new document, beside the old one
std::filesystem::path ConvertBare(const std::filesystem::path& document, const std::string& format);
