#pragma once

/// What the program's exit code says. --help tells the user; scripts rely on the numbers.
enum class ExitCode {
    Done = 0,
    DocumentsAtFault = 1, ///< some documents were refused or could not be converted
    MachineAtFault = 2,   ///< no Office application, no printer, no filter, no space
    WrongUsage = 3,       ///< the command line, the settings or the output folder
    Interrupted = 4,      ///< Ctrl-C or a request to end came before all was done
};
