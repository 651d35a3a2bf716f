#pragma once

#include <wx/string.h>

#include <filesystem>
#include <optional>

/// Why a file is no input, as far as the host can see.
struct Refusal {
    int code = 0; ///< a result code
    wxString reason;
    bool machineAtFault = false; ///< another time it may be one
};

/// Looks whether a filter can be given the file at all: it must be there, a file, readable, not
/// empty, and have a name that is text.
std::optional<Refusal> CheckInput(const std::filesystem::path& file);

/// What a person may want to know of a file that its filter found invalid: what it is instead.
/// @param file readable, with an extension of Office documents
/// @param toldByEngine why the application's engine could not open it; may be empty
wxString DescribeInvalid(const std::filesystem::path& file, const wxString& toldByEngine);
