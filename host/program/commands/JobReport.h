#pragma once

#include "host/program/journal/Journal.h"
#include "host/program/report/Reporter.h"

/// Says what is known of a document, in a line and a record of type "job".
/// @param tellsMachine whether more than one may have it
void TellJob(const Job& job, Reporter& reporter, bool tellsMachine = false);

/// Says how much there is of a watched folder, in a line and a record of type "queue".
void TellFolder(const wxString& folder, const FolderCounts& counts, bool paused,
                Reporter& reporter);

/// For people, by the clock on their wall.
wxString LocalTime(JournalTime time);

/// For records: ISO 8601, UTC; null for no time.
Json RecordTime(JournalTime time);
