#pragma once

#include <string>
#include <vector>

namespace standins {

/// The folders of fonts that fontconfig knows in this process. It is asked once, since that takes
/// as long as printing a page; all modules share the answer.
std::vector<std::string> FontFolders();

} // namespace standins
