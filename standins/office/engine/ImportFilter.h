#pragma once

#include <string>

namespace standins {

/// LibreOffice's name of a document's type. Those of Word 6 and 95 and of PowerPoint 95 have the
/// endings of later ones, and are another type to LibreOffice: what the file says itself decides.
/// @param byEnding the name by the document's ending
std::string ImportFilterOf(const std::string& path, const std::string& byEnding);

} // namespace standins
