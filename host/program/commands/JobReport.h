#pragma once

#include "host/program/journal/Journal.h"
#include "host/program/report/Reporter.h"

/// Says what is known of a document, in a line and a record of type "job".
void TellJob(const Job& job, Reporter& reporter);

/// Says how much there is of a watched folder, in a line and a record of type "queue".
void TellFolder(const wxString& folder, const FolderCounts& counts, bool paused,
                Reporter& reporter);
