#pragma once

#include "standins/office/inprocess/ExportCache.h"

#include <string>
#include <vector>

namespace standins {

/// Pages to be printed into a PostScript file.
struct PrintRequest {
    Export pages;
    std::wstring title;
    std::wstring output; ///< the file's full path
    int copies = 1;
    bool collate = true;
    std::vector<std::string>
        layout{}; ///< further options of the program that writes the PostScript
};

/// @param copies as a client asks for them
/// @throws Raised when nobody can print so many
int CheckCopies(long copies);

/// Prints into a file. The file appears when it is whole; one that had its name before is then
/// replaced, and stays as it was if the print fails.
/// @throws Raised when it fails
void PrintToFile(const PrintRequest& request);

} // namespace standins
