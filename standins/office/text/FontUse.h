#pragma once

namespace standins {

/// Has LibreOffice, in this process, note from now on which fonts text asks for and which it gets.
/// Does nothing where it cannot.
void StartFontUse();

/// Writes what was noted into a file, in UTF-16: for each pair a line with the font asked for, a
/// tab and the font used. A name may be a list, with semicolons, and end with a slash and a style.
/// To be called once, shortly before the process ends.
void WriteFontUse(const char* path);

} // namespace standins
