#pragma once

#include "host/program/base/Fault.h"
#include "host/program/machine/FontStandIns.h"

#include <wx/string.h>

#include <filesystem>
#include <optional>
#include <vector>

/// How far a file has come.
enum class State {
    Accepted,     ///< by its filter; nothing more was asked for
    Converted,    ///< its output is there, or made and to be delivered
    Skipped,      ///< found in a folder, and no filter's business
    Refused,      ///< is no document that can be converted
    Failed,       ///< could not be converted
    NotConverted, ///< its turn did not come
    Changed,      ///< is not what it was, or gone, when its turn came or while it was converted
};

/// What a print server has of a file.
struct PrintedJob {
    wxString server; ///< its address
    wxString queue;
    int number = 0;
    wxString uuid; ///< tells it from another one that gets the same number
};

/// What has become of one file.
struct Outcome {
    std::filesystem::path input;
    std::filesystem::path made;   ///< its output, as long as that is not in its place
    std::filesystem::path output; ///< in its place; empty when there is none
    std::optional<PrintedJob> print;
    State state = State::Accepted;
    std::optional<Fault> fault; ///< why it has come no further
    wxString text;              ///< the result code's message
    std::vector<FontStandIn> fonts;
    std::optional<double> seconds; ///< of screening and conversion

    /// Says that the file comes no further.
    /// @param message of the fault's code
    void End(State how, Fault why, const wxString& message);
};

/// The state's name, as records have it, and people in their language.
const char* NameOf(State state);
