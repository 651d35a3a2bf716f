#pragma once

#include "standins/office/shared/HostOrder.h"
#include "standins/office/supervisor/EngineJob.h"
#include "standins/shared/WorkFolder.h"
#include "standins/supervisor/EngineProcess.h"

#include <string>

namespace standins {

// The files of a work folder.
std::string DocumentPath(const WorkFolder& folder, const EngineJob& job);
/// Named after the document as LibreOffice knows it.
std::string OutputPath(const WorkFolder& folder, const EngineJob& job);
std::string HiddenOutputPath(const WorkFolder& folder);
std::string LogPath(const WorkFolder& folder);

/// How LibreOffice is started on the document in its work folder.
/// @param input open for reading, its standard input
/// @param log open for writing, where its messages go
EngineCommand LibreOfficeCommand(const WorkFolder& folder, const EngineJob& job, int input,
                                 int log);

/// What LibreOffice is asked to do when it is started already.
HostOrder OrderFor(const WorkFolder& folder, const EngineJob& job);

} // namespace standins
