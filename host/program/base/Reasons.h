#pragma once

#include <wx/string.h>

/// A reason that was worded in English, since the stand-ins know no other language or the log has
/// it too, in the language of the program's texts. Numbers, names and the system's words in it
/// stay.
/// @return the reason as it is, when it is none of those that are known
wxString TranslateReason(const wxString& reason);
