#pragma once

#include "host/program/watch/PrintConfiguration.h"

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

/// What holds where a configuration says nothing.
FolderConfiguration StandardFolderConfiguration();

/// For how long a file must stay as it is until it has settled.
/// @param isOnShare where a writer that pauses is seen late
std::chrono::milliseconds SettleTime(const FolderConfiguration& folder, bool isOnShare);

/// Reads what a configuration says of all folders. Throws a Misfit, as all that reads one.
/// @param minFree bytes that must be free for a document to be begun
void ReadDefaults(const ConfigurationValue& table, FolderConfiguration& folder,
                  std::uintmax_t& minFree);

/// Reads what it says of one.
/// @param defaults what holds where it says nothing
/// @param base what paths are relative to
FolderConfiguration ReadFolder(const ConfigurationValue& table, const FolderConfiguration& defaults,
                               const std::filesystem::path& base);
