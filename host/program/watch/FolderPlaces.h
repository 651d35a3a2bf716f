#pragma once

#include "host/program/watch/WatchConfiguration.h"

/// Two places of a configuration that must not lie in each other.
struct Clash {
    enum Place { In, Out, JournalFile };

    std::size_t folder = 0; ///< whose `place` is in the way
    Place place = In;
    wxString what; ///< begins with its key
};

/// Looks for output that would be taken as documents, and documents that two folders would take.
/// Places that are there are compared as they are, links followed; others by their names.
/// @return the first one
std::optional<Clash> FindClash(const WatchConfiguration& configuration);
