#pragma once

#include "host/program/watch/WatchedFolders.h"

/// Removes processed documents whose time is over from the folders whose documents this machine
/// finds, and what the journal tells of those and of documents that vanished. Where documents are
/// kept for ever, the journal tells of them for some months. Some are removed at a time. Throws
/// JournalError.
void RemoveOldDocuments(const WatchedFolders& folders, Journal& journal);
