#pragma once

#include <wx/string.h>

#include <string_view>

/// Checks that a text is well-formed XML, without a document type (whose entities could grow
/// without bound), and not nested deeper than `maximumDepth`; only then is it safe to make a tree
/// of it.
/// @param bytes UTF-8, UTF-16, ISO 8859-1 or ASCII, as the text itself says
/// @return empty, or what is wrong with it and in which line
wxString FindXmlFault(std::string_view bytes, int maximumDepth);
