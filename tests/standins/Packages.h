#pragma once

#include <wx/string.h>

#include <initializer_list>
#include <string>
#include <utility>

// Open XML packages, by their bytes.

/// A sample in which one part, and nothing else, is another.
std::string WithPart(const std::string& sample, const wxString& part, const std::string& content);

/// @param parts by their names; $ in them stands for the address of Open XML's schemas
std::string Package(std::initializer_list<std::pair<const char*, wxString>> parts);
