#pragma once

#include <wx/hashmap.h>
#include <wx/string.h>

/// The filter's settings: text values by key. Keys are compared exactly.
WX_DECLARE_STRING_HASH_MAP(wxString, SettingsMap);
