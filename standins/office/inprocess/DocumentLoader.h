#pragma once

#include "standins/inprocess/DocumentFile.h"
#include "standins/office/inprocess/DocumentFormat.h"
#include "standins/office/inprocess/ExportCache.h"

#include <string>
#include <vector>

namespace standins {

// The steps of opening a document as the applications do. Each throws Raised when it cannot be
// opened.

/// @param formats those that the application opens
const DocumentFormat& FormatOf(const std::wstring& path,
                               const std::vector<DocumentFormat>& formats);

/// @param path full path
DocumentFile OpenDocument(const std::wstring& path);

/// Loads it at once, to the last page; not again when its bytes and path are known.
/// @return what the format makes of it
Export LoadDocument(const std::wstring& path, const DocumentFile& document,
                    const DocumentFormat& format);

} // namespace standins
