#pragma once

#include <wx/string.h>

#include <optional>

/// Makes a language that of the program's texts and its filters'.
/// @param wanted its name, "de" or "de_AT"; without one, the environment's is taken, and English
/// when there are no texts in that
/// @param fault receives which languages there are, when the one wanted is not among them
/// @return whether it is in use
bool UseLanguage(const std::optional<wxString>& wanted, wxString& fault);
