#pragma once

#include "standins/supervisor/Heartbeat.h"

#include <string>

namespace standins {

/// What came of copying a document.
struct DocumentCopy {
    std::string sha256; ///< of the bytes that were copied, in hexadecimal digits
    int error = 0;      ///< errno, 0 when all went well
};

/// Copies a document into a new file and sums it up on the way, so that the sum tells of the very
/// bytes that are in the copy even if somebody writes to the document meanwhile.
/// @param document open for reading; read from its start
/// @param heartbeat beats while the copy goes on
DocumentCopy CopyDocument(int document, const std::string& path, Heartbeat& heartbeat);

} // namespace standins
