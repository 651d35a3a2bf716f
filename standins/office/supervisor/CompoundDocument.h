#pragma once

#include <string>

namespace standins {

// What a compound file says of itself.

/// LibreOffice's name of a document's type. Those of Word 6 and 95 and of PowerPoint 95 have the
/// endings of later ones, and are another type to LibreOffice: what the file says itself decides.
/// @param byEnding the name by the document's ending
std::string ImportFilterOf(const std::string& path, const std::string& byEnding);

/// LibreOffice's name of publications.
constexpr const char* PublicationFilter = "Publisher 98-2010";

/// Whether a file can be a publication of Publisher: a compound file with a stream of that kind.
/// LibreOffice would open anything else as a text, or as what it finds it to be.
bool IsPublication(const std::string& path);

} // namespace standins
