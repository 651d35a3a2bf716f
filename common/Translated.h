#pragma once

#include <wx/string.h>

/// The text in the host's language.
/// @param english the English text, which is its key in the process's wxWidgets catalogue
/// @return its translation, or the English text where there is no catalogue or no entry
wxString Translated(const wxString& english);
