#pragma once

#include "standins/shared/Clocks.h"
#include "standins/shared/ProcessEnd.h"
#include "standins/supervisor/EngineProcess.h"

#include <string>

namespace standins {

// Why an engine failed, as the end of a sentence that begins with the document's name: "letter.doc
// cannot be opened: …". An engine is called by its name, "LibreOffice" for instance.

Failure StallFailure(const std::string& engine, const TimeLimits& limits);
Failure OverdueFailure(const std::string& engine, const TimeLimits& limits);

/// @param status as waitpid gives it
/// @return no failure when the engine ended well, as far as its status tells
Failure DescribeEngineEnd(const std::string& engine, int status, const MemoryShortage& shortage);

/// Blames the machine for what looks like a document's fault when the engine may have had too
/// little of something: files, threads, memory.
/// @param failure may be none
Failure WithTightLimits(const Failure& failure, const EngineCommand& command);

} // namespace standins
