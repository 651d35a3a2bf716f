#pragma once

#include "host/program/base/Fault.h"

#include <cstdio>
#include <nlohmann/json.hpp>

using Json = nlohmann::ordered_json;

/// What the program says: lines for people on stdout; or, if asked for, JSON Lines on stdout and
/// the lines for people on stderr. Everything is UTF-8 and written out at once.
class Reporter {
public:
    /// @param quiet whether only errors and records are written
    explicit Reporter(bool json, bool quiet = false);

    /// From now on a spooler reads stderr, and all that is written goes there, marked with what it
    /// is as spoolers want it.
    void SpeakToSpooler();

    /// A line for people.
    void Line(const wxString& text);

    /// A line that the next one takes the place of. Only for a terminal.
    void Passing(const wxString& text);

    /// Whether people read at a terminal.
    bool ForTerminal() const { return m_forTerminal; }

    /// A JSON record, written only if they were asked for.
    /// @param record has a member "type"
    void Record(const Json& record);

    /// Why the command ends early: for people on stderr in any case, and as a record.
    /// @return the code to end with
    ExitCode Error(const Fault& fault);

private:
    void ClearPassing();

    bool m_json;
    bool m_quiet;
    std::FILE* m_people;
    bool m_forTerminal;
    bool m_passing = false;
    std::string m_lineMark;
    std::string m_errorMark = "quillon: ";
};

/// A text as JSON takes it.
std::string JsonText(const wxString& text);

/// @param texts of any container
template <typename Texts>
Json JsonTexts(const Texts& texts) {
    Json list = Json::array();
    for (const wxString& text : texts)
        list.push_back(JsonText(text));
    return list;
}
