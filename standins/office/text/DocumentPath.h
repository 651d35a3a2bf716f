#pragma once

namespace standins {

/// Has LibreOffice, in this process, find a document by the path that its user knows, while the
/// file is a copy elsewhere: fields and headers print that path. Holds for this path alone, and for
/// reading; no other file comes within reach.
/// @param known, copy full paths, which are kept
void SetDocumentPath(const char* known, const char* copy);

} // namespace standins
