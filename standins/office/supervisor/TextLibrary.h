#pragma once

#include <string>

namespace standins {

/// The library that is loaded in front of LibreOffice's own, see standins/office/text.
std::string TextLibraryPath();

/// Its name in a work folder, where LibreOffice runs: the list of libraries to load in front of
/// others cannot have a path with a space or a colon in it.
constexpr const char* TextLibraryLink = "./text.so";

/// Links it into a work folder.
/// @return false when it cannot be; errno tells why
bool LinkTextLibrary(const std::string& folder);

/// Whether a LibreOffice can be led to the copy of a document by the path that its user knows. It
/// can when it asks the system by the names that the library has.
/// @param program LibreOffice's program folder
bool FindsCopies(const std::string& program);

} // namespace standins
