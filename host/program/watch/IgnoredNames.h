#pragma once

#include <set>
#include <string>

// Which names in a watched folder are no documents. Names are UTF-8, without their folders.

/// Whether the name is that of a file or folder that programs make for themselves: hidden ones,
/// those of transfers that are under way, of open documents, and what desktops leave.
bool IsIgnored(const std::string& name);

/// Whether an application tells, by a file beside it, that it has the document open.
/// @param names all in its folder
bool IsOpenIn(const std::string& name, const std::set<std::string>& names);
