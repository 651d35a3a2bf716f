#pragma once

#include <wx/string.h>

#include <filesystem>
#include <string>
#include <system_error>

/// A path from the command line.
/// @param utf8 UTF-8, or whatever bytes the system has let into a file name
std::filesystem::path FromArgument(const std::string& utf8);

std::filesystem::path FromText(const wxString& text);

/// Whether the path is valid text. Those from outside are asked once, where they come in; what is
/// made of them and of texts is text, too.
bool IsText(const std::filesystem::path& path);

/// The path as filters and the system's functions take it.
/// @return empty when it is not text
wxString ToText(const std::filesystem::path& path);

/// The path for people: one line, bytes that are no text escaped ("\xe4").
wxString Shown(const std::filesystem::path& path);

/// The system's words for an error.
inline wxString Because(const std::error_code& error) {
    return wxString::FromUTF8(error.message());
}
