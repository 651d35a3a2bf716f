#pragma once

#include "host/program/base/ExitCode.h"

#include <wx/string.h>

/// What is to blame for a fault.
enum class Blame {
    Document, ///< is damaged, or wants too much
    Machine,  ///< lacks something, or has no room for it
    Outside,  ///< somebody has ended what was at work; another try may go well
    Usage,    ///< the command line, the settings or the output folder
};

/// The shared table's code for a failure that no filter is to blame for.
constexpr int ConversionFailed = -1003;

/// Why something cannot be done. Whatever can fail hands one out: by a parameter where it has
/// something else to return, and otherwise as an optional, which is empty when all is well.
struct Fault {
    wxString what{}; ///< for people, without a full stop at the end
    Blame blame = Blame::Document;
    int code = ConversionFailed; ///< the result code that says it
    wxString advice{};           ///< what to do about it, likewise; may be empty

    /// Both texts.
    wxString Text() const;
};

/// The code with which a command ends that could not begin.
ExitCode ExitCodeFor(const Fault& fault);
