#pragma once

namespace standins {

/// Gives every signal the effect that it has in a new program, and lets all of them through.
void RestoreDefaultSignals();

} // namespace standins
