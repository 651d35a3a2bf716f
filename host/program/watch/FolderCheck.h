#pragma once

#include "host/program/system/FileSystemKind.h"
#include "host/program/watch/FolderConfiguration.h"

/// How a watch of a folder would work.
struct FolderCheck {
    /// What the system can tell of the files in it.
    struct Sight {
        bool isOnShare = false;
        bool tellsOfChanges = false; ///< so that nobody has to look all the time
        WritersKnown writers = WritersKnown::OfNone;
        std::optional<wxString> watchedBy; ///< at the moment
    };
    std::optional<Sight> sight;  ///< nothing when the folder cannot be watched
    std::vector<Fault> problems; ///< for which its documents cannot be converted and put away
};

/// Looks at the folder as it is at the moment, and leaves nothing in it.
FolderCheck CheckFolder(const FolderConfiguration& folder);
