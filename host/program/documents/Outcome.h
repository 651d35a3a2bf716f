#pragma once

#include "host/program/machine/FontStandIns.h"

#include <wx/string.h>

#include <filesystem>
#include <optional>
#include <vector>

/// How far a file has come.
enum class State {
    Accepted,     ///< by its filter; nothing more was asked for
    Converted,    ///< its output is there
    Skipped,      ///< found in a folder, and no filter's business
    Refused,      ///< is no document that can be converted
    Failed,       ///< could not be converted
    NotConverted, ///< its turn did not come
};

/// What has become of one file.
struct Outcome {
    std::filesystem::path input;
    std::filesystem::path output; ///< empty when there is none
    State state = State::Accepted;
    int code = 0;
    wxString text;               ///< the code's message
    wxString reason;             ///< what the host can add for a person; may be empty
    bool machineAtFault = false; ///< and not the document
    std::vector<FontStandIn> fonts;
    std::optional<double> seconds; ///< of screening and conversion
};

/// The shared table's code for a failure that no filter is to blame for.
constexpr int ConversionFailed = -1003;

/// The state's name, as records have it, and people in their language.
const char* NameOf(State state);

/// Whether a result code says that something is missing on the machine.
bool IsMachineCode(int code);
