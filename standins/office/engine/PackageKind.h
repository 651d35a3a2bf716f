#pragma once

#include <string>

namespace standins {

/// Whether an Office Open XML package says of itself that it is a document of another application
/// than its extension tells. LibreOffice would not mind, and open a workbook as an empty text.
/// @param extension without a dot; others than those of packages are never denied
/// @return false too when the package tells nothing that can be understood: LibreOffice decides
/// then
bool IsPackageOfAnotherKind(const std::string& path, const std::string& extension);

} // namespace standins
