#pragma once

#include <string>

namespace standins {

/// Whether an Office Open XML package says of itself that it is a document of another application
/// than it is taken for. LibreOffice would not mind, and open a workbook as an empty text.
/// @param importFilter LibreOffice's name of the type it is taken for; others than packages are
/// never denied
/// @return false too when the package tells nothing that can be understood: LibreOffice decides
/// then
bool IsPackageOfAnotherKind(const std::string& path, const std::string& importFilter);

} // namespace standins
