#pragma once

#include <string>

/// A digest of the fonts that are installed, by their names and versions: machines with the same
/// one set the same text alike.
std::string DigestOfFonts();
