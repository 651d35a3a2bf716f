#pragma once

#include "standins/inprocess/DocumentFile.h"
#include "standins/office/inprocess/DocumentFormat.h"
#include "standins/shared/Failure.h"

#include <string>

namespace standins {

/// What came of an engine run.
struct EngineResult {
    Descriptor output;       ///< what LibreOffice made
    Descriptor hiddenOutput; ///< the same with hidden slides; closed when it is not known
    std::string sha256;
    std::string fonts; ///< those that others stood in for, as LeaveFonts takes them
    Failure failure;
};

/// Lets LibreOffice convert a document, under a supervisor of its own, and returns when nothing of
/// the run is left: no process, no file. The supervisor sees to it that LibreOffice ends; that the
/// supervisor itself ends is seen to here.
EngineResult RunEngine(const std::wstring& path, const DocumentFile& document,
                       const DocumentFormat& format);

/// Clears away what is left of runs whose processes were all killed.
void ClearAfterKilledRuns();

} // namespace standins
