#pragma once

#include <wx/string.h>

#include <cstdint>

/// Reads a file's size.
/// @param path the file
/// @param size receives the size in bytes; stays as it was when the file cannot be looked at
void QueryFileSize(const wxString& path, std::uint64_t& size);
