#pragma once

#include "standins/inprocess/SupervisedRun.h"

#include <string>

namespace standins {

/// Runs LibreOffice as RunSupervised does. Where the settings say that it is kept for several
/// documents, it is started for the first of them; then the documents of this process have it one
/// at a time, and what another thread wants meanwhile is done without.
/// @param program LibreOffice's program folder
Message RunByKeptEngine(const SupervisedRun& run, const std::string& program);

/// Tries whether LibreOffice can be kept.
/// @return why not, a sentence's end; empty when it can
std::wstring WhyEngineCannotBeKept(const std::string& program);

/// Ends the LibreOffice that is kept, if there is one.
void EndKeptEngine();

} // namespace standins
