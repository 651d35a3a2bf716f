#pragma once

#include "host/program/base/ExitCode.h"
#include "host/program/commands/CommonOptions.h"
#include "host/program/report/Reporter.h"

#include <functional>

/// The command that a command line asks for.
struct Command {
    /// Runs it, when what it needs is set up.
    /// @return the code to end with
    std::function<ExitCode(const CommonOptions&, Reporter&)> run;

    bool opensDocuments = false; ///< and none without isolation where that is required
    bool needsMachine = true;    ///< to be set up, with all that documents are converted with
    bool showsWindows = false;
    bool examinesEngine = false; ///< says how the engine can be run
    bool isWorker = false;       ///< another process of this program decides when it ends
    bool isFilter = false;       ///< a spooler calls it, reads what it says, and ends it at once
};

/// Adds a command with its options to the program's.
/// @param chosen receives the command when it is asked for
using AddCommand = void(CLI::App& program, Command& chosen);

// Each has a file of its own, with its options and its run.

/// `quillon status`: says what there is to convert with, and what is missing.
AddCommand AddStatus;
/// `quillon screen`: says of each file whether it can be converted.
AddCommand AddScreen;
/// `quillon convert`: converts documents into a folder.
AddCommand AddConvert;
/// `quillon filter`: converts a document that a print server spools.
AddCommand AddFilter;
/// `quillon print-server`: has the print server of the system call that, or not.
AddCommand AddPrintServer;
/// `quillon settings`: shows the filters' settings panels in a window, and stores what is chosen.
AddCommand AddSettings;
/// `quillon watch`: converts what comes into folders.
AddCommand AddWatch;
/// `quillon serve`: converts what watches on other machines find.
AddCommand AddServe;
/// `quillon queue`: says what has become of documents in watched folders.
AddCommand AddQueue;
/// `quillon retry`: has failed documents tried again.
AddCommand AddRetry;
/// `quillon cancel`: has print servers cancel documents.
AddCommand AddCancel;
/// `quillon pause`: has no documents begun.
AddCommand AddPause;
/// `quillon resume`: has them begun again.
AddCommand AddResume;
/// `quillon worker`: converts what another process of this program asks for; see WorkerPool.
AddCommand AddWorker;

/// All of them, in the order of the help.
constexpr AddCommand* AllCommands[] = {AddStatus, AddScreen,      AddConvert,  AddWatch, AddServe,
                                       AddQueue,  AddRetry,       AddCancel,   AddPause, AddResume,
                                       AddFilter, AddPrintServer, AddSettings, AddWorker};
