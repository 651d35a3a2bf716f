#pragma once

/// Ctrl-C, and the system's request to end.
namespace Interruption {

/// From now on the first such request is only noted, so that the document under way is finished;
/// a second one ends the process.
void Install();

/// Whether one has come.
bool Requested();

} // namespace Interruption
