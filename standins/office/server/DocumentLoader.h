#pragma once

#include "standins/office/server/DocumentFormat.h"
#include "standins/office/server/PdfCache.h"

#include <string>
#include <vector>

namespace standins {

/// Opens a document as the applications do: it is loaded at once, to the last page.
/// @param path full path
/// @param formats those that the application opens
/// @return its pages
/// @throws Raised when it cannot be opened
Pdf LoadDocument(const std::wstring& path, const std::vector<DocumentFormat>& formats);

} // namespace standins
