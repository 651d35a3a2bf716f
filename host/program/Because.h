#pragma once

#include <wx/string.h>

#include <system_error>

/// The system's words for an error.
inline wxString Because(const std::error_code& error) {
    return wxString::FromUTF8(error.message());
}
