#pragma once

#include "host/program/base/Fault.h"
#include "host/program/journal/PathMap.h"
#include "host/program/watch/PrintConfiguration.h"

#include <wx/string.h>

#include <chrono>
#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>
#include <vector>

/// What becomes of an output whose name is taken.
enum class OnSameName {
    Number,  ///< it is called "letter (2)"
    Replace, ///< the other one goes
};

/// What becomes of files in a watched folder that no filter takes.
enum class Others {
    Leave, ///< they stay where they are
    Fail,  ///< they fail, as documents do that are refused
    Pass,  ///< they come out as they are
};

/// One watched folder.
struct FolderConfiguration {
    wxString name;
    std::filesystem::path in; ///< absolute, as all paths here
    std::filesystem::path out;
    bool isOthers = false; ///< another machine finds its documents, and has told of the folder
    std::optional<std::filesystem::path> settings; ///< the file, read anew for each document
    std::optional<std::string> settingsText;       ///< what it says, where another machine has it
    std::vector<std::string> assignments;          ///< KEY=VALUE, in place of the file's
    std::optional<std::string> language;           ///< of reasons; the program's if not given
    int priority = 50;
    bool byName = false;      ///< documents in the order of their names, not of their arrival
    bool folderIsJob = false; ///< a folder inside is begun when all in it has settled
    OnSameName onSameName = OnSameName::Number;
    Others others = Others::Leave;
    std::optional<std::chrono::milliseconds>
        settle;                                ///< as long as the file system wants if not given
    std::optional<PrintConfiguration> print;   ///< otherwise the output goes to `out`
    std::vector<std::chrono::seconds> retries; ///< the time before each further attempt
    std::optional<std::chrono::seconds> keepProcessed; ///< for ever if not given
};

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
FolderConfiguration StandardFolderConfiguration();
WatchConfiguration StandardWatchConfiguration();

/// For how long a file must stay as it is until it has settled.
/// @param isOnShare where a writer that pauses is seen late
std::chrono::milliseconds SettleTime(const FolderConfiguration& folder, bool isOnShare);

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
