#pragma once

#include "host/program/base/Fault.h"

#include <optional>

/// Finds the language that is meant by a name like "de" or "de_AT.UTF-8".
/// @param fault receives that there are no texts in it, with those that there are
std::optional<wxString> FindLanguage(const wxString& wanted, Fault& fault);

/// Makes a language that of the program's texts and its filters'.
/// @param wanted its name, "de" or "de_AT"; without one, the environment's is taken, and English
/// when there are no texts in that
/// @return that there is none such
std::optional<Fault> UseLanguage(const std::optional<wxString>& wanted);
