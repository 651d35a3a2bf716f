#pragma once

#include "host/program/page/Html.h"
#include "host/program/page/Page.h"

/// Whether all is well, the sums, and the button that pauses all.
void WriteState(Html& html, const PageContent& content);

/// The watched folders.
void WriteFolders(Html& html, const PageContent& content);

/// The documents under way.
void WriteRunning(Html& html, const PageContent& content);

/// The machines that share the journal, if any do.
void WriteMachines(Html& html, const PageContent& content);

/// The documents that have failed last, with their reasons.
void WriteFailed(Html& html, const PageContent& content);

/// The documents that were done last.
void WriteDone(Html& html, const PageContent& content);

/// The beginning of a form with what all forms have.
void BeginForm(Html& html, const PageContent& content, const char* action);

/// How many documents of a folder, or of all, have come to a state.
/// @param folder its name; null for all
std::size_t CountOf(const JournalExtract& journal, JobState state, const wxString* folder);

/// How many documents of a folder, or of all, are being converted, by this machine or another.
/// @param folder its name; null for all
std::size_t CountUnderWay(const PageContent& content, const wxString* folder);
