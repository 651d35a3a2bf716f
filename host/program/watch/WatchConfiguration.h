#pragma once

#include "host/program/base/Fault.h"
#include "host/program/journal/PathMap.h"
#include "host/program/watch/FolderConfiguration.h"

/// What a watch works by.
struct WatchConfiguration {
    std::string journal;            ///< for OpenJournal
    PathMap map;                    ///< likewise, where machines share it
    std::chrono::seconds lease{30}; ///< after which a machine that says nothing has lost its work
    unsigned jobs = 0; ///< documents at a time; 0 for as many as pay, or none where machines share
                       ///< the journal and this one finds documents
    std::string http;  ///< HOST:PORT of the page; empty for none
    std::uintmax_t minFree = 0; ///< bytes that must be free for a document to be begun
    std::vector<FolderConfiguration> folders;
};

/// What holds where a configuration says nothing.
WatchConfiguration StandardWatchConfiguration();

/// Whether a configuration must have folders.
enum class FoldersNeed { Some, None };

/// Reads a configuration. Its paths are relative to its own folder.
/// @param fault receives why it cannot be used, with line and column
std::optional<WatchConfiguration> ReadWatchConfiguration(const std::filesystem::path& file,
                                                         Fault& fault,
                                                         FoldersNeed need = FoldersNeed::Some);

/// A lease that is of use: shorter ones run out while a server is only slow.
constexpr std::chrono::seconds ShortestLease{3};
constexpr std::chrono::seconds LongestLease{3600};
