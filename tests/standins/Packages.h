#pragma once

#include <wx/string.h>

#include <string>

// Documents of the tests' own, by their bytes.

/// A text of the folder "documents", with a value in each place that is marked by {}.
std::string TestText(const std::string& name, const std::string& value = {});

/// An Open XML package from such a text, NAME.txtar, which has one part behind the other: each
/// below a line "-- PART --".
std::string Package(const std::string& name, const std::string& value = {});

/// A sample in which one part, and nothing else, is another.
std::string WithPart(const std::string& sample, const wxString& part, const std::string& content);
