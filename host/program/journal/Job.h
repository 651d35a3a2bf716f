#pragma once

#include "host/program/documents/Outcome.h"
#include "host/program/system/FileIdentity.h"

#include <wx/string.h>

#include <chrono>
#include <filesystem>
#include <optional>

/// How far a document of a watched folder has come. The journal has them by name (NameOf).
enum class JobState {
    Waiting,    ///< for its turn
    Converting, ///< a worker has it
    Submitting, ///< converted; its output is being given to a print server
    Printing,   ///< the print server has it
    Delivering, ///< converted; its output is being moved from its workplace to its place
    Finished,   ///< its output is in its place; its source is still to be put away
    Archived,   ///< done with
    Failed,     ///< comes no further; its source is to be put away while the job is open
    Vanished,   ///< its source had gone, or become another, before its turn
};

/// The journal's clock: the system's, or that of the server that keeps the journal.
using JournalTime = std::chrono::system_clock::time_point;

/// What a print server has of a document, or is to have: as long as its number is 0 there is none.
struct PrintOrder : PrintedJob {
    bool held = false; ///< it waits there for a person: the server had lost it once
    wxString message;  ///< what the server says of it, in its own words; or empty
};

/// A document that was found in a watched folder, and what has become of it. A value: a change is
/// in the journal when it is committed.
struct Job {
    std::int64_t id = 0;
    wxString folder;              ///< the watched folder's name
    std::filesystem::path source; ///< where the file is, absolute; follows it when it is put away
    wxString inside; ///< the folder inside the watched one that it was found in, with '/'; or empty
    FileIdentity identity; ///< of the source, as its finder saw it
    /// The source's SHA-256, in hexadecimal digits, where machines share the journal; or empty. By
    /// it another machine knows the file, to which device and number say nothing.
    std::string digest;
    int priority = 50; ///< 1 to 100
    JobState state = JobState::Waiting;
    bool open = true; ///< its source is where it was found; no other job has that file then

    int attempts = 0; ///< begun, those left out that the machine was to blame for
    int deaths = 0;   ///< of those, how many ended the program
    JournalTime inserted;
    JournalTime due;    ///< when it may be tried
    JournalTime begun;  ///< its last attempt
    JournalTime ended;  ///< when it came to its last state
    double seconds = 0; ///< of its last attempt

    std::filesystem::path workplace; ///< while it is converted and delivered; or empty
    wxString product;                ///< the name of its output's file in there
    std::filesystem::path output;    ///< where its output goes, or has gone; or empty

    std::filesystem::path aside; ///< where its source is to be put away, or has been; or empty

    PrintOrder print;

    std::optional<Fault> fault; ///< of its last attempt
    wxString text;              ///< the message of the fault's code

    wxString claimedBy;     ///< who has it, or had it last
    std::int64_t token = 0; ///< grows with each claim: whoever has an old one has the job no more
};

/// Whether it is to be printed by a print server, or there already.
constexpr bool IsAtPrinter(JobState state) {
    return state == JobState::Submitting || state == JobState::Printing;
}

/// Whether its output lies in its workplace yet.
constexpr bool HasProduct(JobState state) {
    return IsAtPrinter(state) || state == JobState::Delivering;
}

/// The state's name, as journal and records have it, and people in their language.
const char* NameOf(JobState state);

/// @return nothing for what is no state's name
std::optional<JobState> JobStateOf(const wxString& name);
