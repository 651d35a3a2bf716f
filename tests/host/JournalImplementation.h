#pragma once

#include "host/program/journal/Journal.h"

#include <ostream>

/// What keeps journals, for the tests of what all of them do.
struct JournalImplementation {
    const char* name;
    /// @param folder of the test: the same one gives the same journal
    /// @param now its clock; outlives it
    std::unique_ptr<Journal> (*open)(const std::filesystem::path& folder, const JournalTime& now);
    std::string (*obstacle)(); ///< why there is none on this machine; empty when there is
};

inline std::ostream& operator<<(std::ostream& stream, const JournalImplementation& each) {
    return stream << each.name;
}

/// All beside the file's that there are on this system.
std::vector<JournalImplementation> SharedImplementations();
