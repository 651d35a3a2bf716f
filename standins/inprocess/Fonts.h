#pragma once

#include <string>
#include <vector>

namespace standins {

/// The folders of fonts that fontconfig knows in this process. It is asked once, since that takes
/// as long as printing a page; all modules share the answer.
std::vector<std::string> FontFolders();

// What fontconfig knows of a font by its family's name, UTF-8, in any of its languages.

bool IsFontInstalled(const std::string& family);

/// Whether one font was made so that text set in it runs like text in the other: no line breaks
/// elsewhere.
bool HasSameMetrics(const std::string& asked, const std::string& used);

} // namespace standins
