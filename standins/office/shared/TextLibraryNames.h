#pragma once

namespace standins {

// What engines and the library that is loaded in front of LibreOffice's know each other by.

/// By these an engine learns the path by which its user knows the document, and that of the copy it
/// works on, see text/DocumentPath.h.
constexpr const char* KnownPathVariable = "OFFICE_DOCUMENT";
constexpr const char* CopyVariable = "OFFICE_DOCUMENT_COPY";

/// Where in its work folder an engine says which fonts were asked for and used, see
/// text/FontUse.h.
constexpr const char* FontUseFile = "fonts.txt";

} // namespace standins
