#pragma once

#include "standins/office/supervisor/EngineJob.h"
#include "standins/shared/Channel.h"

namespace standins {

class OfficeHost;

/// Does a whole engine run: makes the work folder, copies the document into it, lets LibreOffice
/// convert it under the two clocks, and clears everything away again; then tells the server, by a
/// message Done with the output attached and the document's SHA-256 as its text, or by a message
/// Failed with the reason. While it works it sends a message Alive from time to time. When the
/// server goes, everything ends at once.
/// @param document open for reading
/// @param host of a LibreOffice that is kept started, to be used as long as there is nothing wrong
/// with it; null when LibreOffice is to be started for the document
void Supervise(const EngineJob& job, int document, const Channel& server,
               OfficeHost* host = nullptr);

} // namespace standins
