#pragma once

#include <wx/string.h>

/// Ctrl-C, and the system's request to end.
namespace Interruption {

/// From now on the first such request is only noted, so that the document under way is finished;
/// a second one ends the process.
void Install();

/// What is said on standard error, in a line of its own, when such a request is noted.
void SetNote(const wxString& note);

/// From now on, after Install, such a request ends the process at once, as one that has been noted
/// does now.
void EndAtOnce();

/// For a process that another one of this program has started: the other one decides, and such
/// requests, which a terminal sends to both, mean nothing here.
void LeaveToParent();

/// Whether one has come.
bool Requested();

/// From now on, after Install, a hang-up is no request to end, but one to read the configuration
/// anew. Not every system has such a request.
void ReloadOnHangUp();

/// Whether one of those has come since this was asked last.
bool ReloadRequested();

} // namespace Interruption
