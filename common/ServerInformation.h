#pragma once

#include <wx/string.h>

#include <cstdint>

/// Asks the server information for the server's version.
/// @param serverInfo an XML text with an element "ServerVersion" anywhere below its root
/// @param minimum the version wanted
/// @return true when the text names a version of at least `minimum`; false also for a text that
/// is empty, no XML or without a version
bool ServerVersionAtLeast(const wxString& serverInfo, std::int32_t minimum);
