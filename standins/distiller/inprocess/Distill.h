#pragma once

#include "standins/shared/Failure.h"

#include <string>

namespace standins {

/// The values of the bridge's result.
enum class DistillResult {
    Done = 0,
    BadRequest = 1,     ///< the record or a text of it is none
    NoPostScript = 2,   ///< the PostScript file cannot be read
    NoProfile = 3,      ///< there is no such profile, or it cannot be read
    NoEngine = 4,       ///< Ghostscript is not there
    NotConverted = 5,   ///< Ghostscript could not convert the file
    NoOutput = 6,       ///< the PDF file cannot be written
    UnexpectedFault = 7 ///< of the bridge
};

/// A conversion as it is asked for, in UTF-8.
struct DistillRequest {
    std::string postScript; ///< full path
    std::string pdf;        ///< full path
    std::string profile;    ///< a file name; empty for Ghostscript's own defaults
};

struct DistillOutcome {
    DistillResult result = DistillResult::Done;
    Failure failure;
};

/// Lets Ghostscript make the PDF file. It appears when it is whole; a file that had its name before
/// is then replaced, and stays as it was if the conversion fails.
DistillOutcome Distill(const DistillRequest& request);

} // namespace standins
