#pragma once

#include "host/program/commands/Command.h"
#include "host/program/journal/Journal.h"

/// Which journal a command works on, as it was given.
struct JournalOptions {
    std::optional<std::string> journal;
    std::optional<std::string> queue;
    std::optional<std::string> configuration;
};

/// A journal, and the folders that are configured with it, if they are known.
struct NamedJournal {
    std::string where; ///< for OpenJournal
    PathMap map;
    std::vector<wxString> folders;
};

/// @param options receives what is given, and outlives the parsing
void AddJournalOptions(CLI::App& command, JournalOptions& options);

/// Adds the option that names a queue, which machines share.
void AddQueueUrl(CLI::App& command, std::optional<std::string>& url);

/// The journal that is named, or that of the configuration that is; otherwise that of the folders
/// which this machine watches, or the user's.
/// @param fault receives what is wrong with the configuration
std::optional<NamedJournal> FindJournal(const JournalOptions& options, Fault& fault);

/// What a command does with a journal. May throw JournalError.
using JournalWork = std::function<ExitCode(Journal& journal, const NamedJournal& named)>;

/// Opens the journal, which need not be in use, and does the work; or says why that cannot be.
/// @param withNone is done in place of it where there is no journal; without it that is a mistake
ExitCode WorkOnJournal(const JournalOptions& options, Reporter& reporter, const JournalWork& work,
                       const std::function<ExitCode(const NamedJournal&)>& withNone = {});

/// The fault of a folder that neither the configuration nor the journal knows.
std::optional<Fault> FindUnknown(const wxString& folder, Journal& journal,
                                 const NamedJournal& named);
