#pragma once

#include <wx/string.h>

#include <filesystem>
#include <optional>
#include <string>
#include <system_error>

/// A path from the command line.
/// @param utf8 UTF-8, or whatever bytes the system has let into a file name
std::filesystem::path FromArgument(const std::string& utf8);

std::filesystem::path FromText(const wxString& text);

/// The path as a filter can take it.
/// @return nothing when its name is not valid text
std::optional<wxString> ToText(const std::filesystem::path& path);

/// The path for people: one line, bytes that are no text escaped ("\xe4").
wxString Shown(const std::filesystem::path& path);

/// The system's words for an error.
inline wxString Because(const std::error_code& error) {
    return wxString::FromUTF8(error.message());
}
