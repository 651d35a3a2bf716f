#pragma once

namespace standins {

/// By these an engine learns the path by which its user knows the document, and that of the copy it
/// works on, see text/DocumentPath.h.
constexpr const char* KnownPathVariable = "OFFICE_DOCUMENT";
constexpr const char* CopyVariable = "OFFICE_DOCUMENT_COPY";

} // namespace standins
