#pragma once

namespace standins {

/// Whether a file is a PDF with its end: Ghostscript can lose the end on a full disk and call the
/// work done.
/// @param pdf open, for writing only if need be
bool IsWholePdf(int pdf);

} // namespace standins
