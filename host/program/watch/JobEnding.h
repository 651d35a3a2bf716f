#pragma once

#include "host/program/journal/Journal.h"
#include "host/program/report/Texts.h"
#include "host/program/watch/FolderConfiguration.h"

// The last steps of a document's way. Each is told to the journal before it is done, so that
// whoever finds the journal after the program was ended between any two of them knows what is left
// to do, and does it by the same functions. They throw JournalError and JobLost.

/// Moves what was made of a document to its place, and makes the job Finished.
/// @param job Delivering, with its workplace and its product
/// @return why it is not there; it may be tried again
std::optional<Fault> DeliverProduct(Job& job, const FolderConfiguration& folder, Journal& journal);

/// Moves the source of a job that is Finished to the folder "processed", or that of one that has
/// Failed to "failed", a note beside it; the job is closed then. A source that is another file by
/// now, or gone, stays as it is.
/// @param texts for the note
/// @return why it is not done; it may be tried again
std::optional<Fault> PutSourceAway(Job& job, const FolderConfiguration& folder, const Texts& texts,
                                   Journal& journal);

/// Removes the folders that a document was found in, up to the watched one, as far as they are
/// empty.
void RemoveEmptyFolders(const Job& job, const std::filesystem::path& in);
