#pragma once

#include "standins/distiller/supervisor/DistillerJob.h"
#include "standins/shared/Channel.h"

namespace standins {

/// Does a whole engine run: makes the work folder, lets Ghostscript write the PDF under the two
/// clocks, and clears everything away again; then tells the bridge, by a message Done, or Failed
/// with the reason as the end of a sentence. While it works it sends a message Alive from time to
/// time. When the bridge goes, everything ends at once.
void Supervise(const DistillerJob& job, const Channel& bridge);

} // namespace standins
