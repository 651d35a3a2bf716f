#pragma once

#include "host/program/journal/Journal.h"

/// A watched folder, as the one that finds its documents tells others of it, who work on them.
struct AnnouncedFolder {
    wxString name;
    std::string configuration; ///< JSON, with paths as all machines call them
    std::string settings;      ///< for its documents, XML

    bool operator==(const AnnouncedFolder& other) const {
        return name == other.name && configuration == other.configuration &&
               settings == other.settings;
    }
};

/// What pages look like depends on these: a document must not look another way because another
/// machine had it.
struct PageMakers {
    wxString program; ///< this program's version
    wxString office;  ///< what opens the documents, with its version
    wxString pdf;     ///< what makes PDF of them
    wxString fonts;   ///< a digest of those that are installed

    bool operator==(const PageMakers& other) const {
        return program == other.program && office == other.office && pdf == other.pdf &&
               fonts == other.fonts;
    }
};

/// A program that works on a shared journal.
struct Machine {
    wxString name; ///< the claimant's
    bool finds = false;
    unsigned jobs = 0; ///< documents at a time at the most; 0 for none
    PageMakers makers; ///< empty where it converts nothing
    bool takesAnyVersion = false;
    std::set<std::string> cannot; ///< see Claimant
    std::size_t running = 0;      ///< documents
    wxString obstacle;            ///< why it begins none, in its language; or empty

    // What follows is the journal's, by its clock.
    JournalTime started;
    JournalTime seen;     ///< its last report
    bool isAlive = false; ///< it has reported within its lease
};

/// What programs on several machines say to each other by a journal. All throw JournalError.
class SharedJournal {
public:
    virtual ~SharedJournal() = default;

    /// Tells of folders, in place of what was told of those of the same names.
    /// @param finder who tells, by a name that it has each time it runs
    /// @param all names of its folders, also of those that it does not tell of now: what it has
    /// told
    ///     of others is taken back
    virtual void Announce(const std::vector<AnnouncedFolder>& folders, const wxString& finder,
                          const std::vector<wxString>& all) = 0;
    /// All that have been told of, by their names.
    virtual std::vector<AnnouncedFolder> Announced() = 0;

    /// Says how a machine is. Those that have not reported for a day are forgotten.
    virtual void Report(const Machine& machine, const Claimant& claimant) = 0;
    /// Says that it ends.
    virtual void TakeLeave(const wxString& machine) = 0;
    /// By their start, those that are alive first.
    virtual std::vector<Machine> Machines() = 0;
};
