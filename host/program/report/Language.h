#pragma once

#include "host/program/base/Fault.h"

#include <optional>

/// Makes a language that of the program's texts and its filters'.
/// @param wanted its name, "de" or "de_AT"; without one, the environment's is taken, and English
/// when there are no texts in that
/// @return that there is none such
std::optional<Fault> UseLanguage(const std::optional<wxString>& wanted);
