#pragma once

#include "standins/distiller/supervisor/DistillerJob.h"
#include "standins/shared/WorkFolder.h"
#include "standins/supervisor/EngineProcess.h"

#include <string>

namespace standins {

/// What Ghostscript says when it has read the profile to its end.
constexpr const char* ProfileIsRead = "%%[Profile is read]%%";

/// How Ghostscript is started in its work folder.
/// @param input open for reading, its standard input
/// @param log open for writing, where its messages go
EngineCommand GhostscriptCommand(const WorkFolder& folder, const DistillerJob& job, int input,
                                 int log);

} // namespace standins
