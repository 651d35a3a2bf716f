#pragma once

#include "host/program/documents/Outcome.h"
#include "host/program/journal/Job.h"
#include "host/program/watch/FolderConfiguration.h"

// What becomes of a job. These change the job alone; the journal is told by whoever calls them.

/// What is decided by besides the job itself.
struct Circumstances {
    JournalTime now;       ///< of the journal
    bool isShared = false; ///< by other machines, which may be able to do what this one cannot
};

/// What a document's outcome says of its folder.
enum class FolderNews {
    None,
    Works,   ///< the machine can convert its documents
    Blocked, ///< it cannot
};

/// Decides by what came of a document's conversion: it is delivered, tried again when its time
/// comes, or comes no further. What the machine is to blame for is no attempt of the document's.
/// @param job Converting; afterwards Submitting, Delivering, Waiting, Failed or Vanished
FolderNews DecideByOutcome(Job& job, const Outcome& outcome, const FolderConfiguration& folder,
                           const Circumstances& circumstances);

/// Before a document is tried again that the machine could not convert: longer than its folder
/// waits, so that another one comes first, in case it is this one that the machine cannot do.
constexpr std::chrono::seconds GivenBackFor(40);

/// Has a job tried again after an attempt that says nothing of the document.
void GiveBack(Job& job, const Circumstances& circumstances,
              std::chrono::seconds delay = GivenBackFor);

/// Says that a job comes no further.
/// @param state Finished or Failed
void End(Job& job, JobState state, JournalTime now);

/// Decides on a job whose attempt ended the program: it is tried again, but not for ever.
/// @param text the message of the code with which it may fail
void DecideByDeath(Job& job, const wxString& text, JournalTime now);
