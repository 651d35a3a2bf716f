#pragma once

#include "host/program/journal/SharedJournal.h"
#include "host/program/watch/FolderConfiguration.h"

/// What a machine that finds a folder's documents tells others of it.
/// @param fault receives why it cannot be told: its settings file cannot be read
std::optional<AnnouncedFolder> AnnouncementOf(const FolderConfiguration& folder, const PathMap& map,
                                              Fault& fault);

/// A folder that another machine has told of, as it is to be worked for on this one.
/// @param fault receives why it cannot be, for instance that this machine does not have its share
std::optional<FolderConfiguration> FolderOf(const AnnouncedFolder& announced, const PathMap& map,
                                            Fault& fault);
