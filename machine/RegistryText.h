#pragma once

#include "common/UniqueHandle.h"

#include <wx/string.h>
// After the strings, which it takes for granted.
#include <wx/msw/registry.h>

#include <optional>

// How facts about the machine are read from the registry. What is missing is a fact too: nothing is
// logged of it.

/// Opens a key for reading.
/// @return an empty handle when there is none
RegistryKeyHandle OpenRegistryKey(HKEY root, const wxString& path);

bool HasDefaultValue(const RegistryKeyHandle& key);

/// Reads a path as it stands, of at most MAX_PATH characters with its terminating zero.
/// @param name null for the key's default value
/// @return nothing when there is none, or a longer one
std::optional<wxString> ReadRegistryPath(const RegistryKeyHandle& key, const wchar_t* name);

/// Reads a text of any length; the environment's variables are filled in where it is of the type
/// that has them.
/// @param name empty for the key's default value
/// @return nothing when there is none
std::optional<wxString> ReadRegistryText(wxRegKey::StdKey root, const wxString& path,
                                         const wxString& name);
