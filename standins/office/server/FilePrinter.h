#pragma once

#include "standins/office/server/PdfCache.h"

#include <string>

namespace standins {

/// Pages to be printed into a PostScript file.
struct PrintRequest {
    Pdf pages;
    std::wstring title;
    std::wstring output; ///< the file's full path
    int copies = 1;
    bool collate = true;
};

/// Prints into a file. The file appears when it is whole; one that had its name before is then
/// replaced, and stays as it was if the print fails.
/// @throws Raised when it fails
void PrintToFile(const PrintRequest& request);

} // namespace standins
