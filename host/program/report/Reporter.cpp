#include "host/program/report/Reporter.h"

#include "host/program/system/Console.h"
#include "host/services/OneLine.h"

namespace {

void Write(std::FILE* stream, const std::string& text) {
    std::fwrite(text.data(), 1, text.size(), stream);
    std::fflush(stream);
}

} // namespace

Reporter::Reporter(bool json, bool quiet)
    : m_json(json), m_quiet(quiet), m_people(json ? stderr : stdout),
      m_forTerminal(IsTerminal(m_people) && !quiet) {}

void Reporter::SpeakToSpooler() {
    m_json = false;
    m_people = stderr;
    m_forTerminal = false;
    m_lineMark = "INFO: ";
    m_errorMark = "ERROR: ";
}

void Reporter::ClearPassing() {
    if (m_passing)
        Write(m_people, "\r\x1b[K");
    m_passing = false;
}

void Reporter::Line(const wxString& text) {
    if (m_quiet)
        return;
    ClearPassing();
    Write(m_people, m_lineMark + text.utf8_string() + '\n');
}

void Reporter::Passing(const wxString& text) {
    if (!m_forTerminal)
        return;
    Write(m_people, "\r\x1b[K" + text.utf8_string());
    m_passing = true;
}

void Reporter::Record(const Json& record) {
    if (!m_json)
        return;
    ClearPassing(); // both streams may show on one terminal
    Write(stdout, record.dump(-1, ' ', false, Json::error_handler_t::replace) + '\n');
}

ExitCode Reporter::Error(const Fault& fault) {
    const wxString text = fault.Text();
    ClearPassing();
    Write(stderr, m_errorMark + OneLine(text).utf8_string() + '\n');
    Record({{"type", "error"}, {"text", JsonText(text)}});
    return ExitCodeFor(fault);
}

std::string JsonText(const wxString& text) {
    return text.utf8_string();
}
