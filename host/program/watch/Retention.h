#pragma once

#include "host/program/journal/Journal.h"
#include "host/program/watch/FolderConfiguration.h"

/// Removes a folder's processed documents whose time is over, and what the journal tells of those
/// and of documents that vanished. Where documents are kept for ever, the journal tells of them for
/// some months. Some are removed at a time. Throws JournalError.
void RemoveOldDocuments(const FolderConfiguration& folder, Journal& journal);
