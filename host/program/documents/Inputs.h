#pragma once

#include <wx/string.h>

#include <filesystem>
#include <string>
#include <vector>

/// One file to screen or to convert.
struct Input {
    std::filesystem::path given; ///< as the user wrote it, or found it in a folder
    std::filesystem::path full;  ///< absolute
    bool named = true;           ///< by the user; false for one found in a folder
};

/// The files that the arguments mean, in their order, each once. A folder means the files directly
/// in it by name, hidden ones and the lock files of open documents (~$…) left out; one that cannot
/// be read stands for itself.
std::vector<Input> ListInputs(const std::vector<std::string>& arguments);

/// The file name's extension without its dot.
wxString ExtensionOf(const Input& input);
