#pragma once

#include <wx/string.h>

/// The text as it can stand on one line, of a log or of a terminal: control characters, line
/// separators and the marks that turn the writing direction are escaped ("\n", "\x1b", "\u2028"),
/// and so is half a surrogate pair, which no encoding can carry. All else stays, backslashes too.
wxString OneLine(const wxString& text);
