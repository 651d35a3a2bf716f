#include "common/WQServices.h"
#include "host/services/Log.h"
#include "host/services/OneLine.h"

#include <wx/datetime.h>
#include <wx/utils.h>

struct LogRecord::Content {
    SeverityLevel level;
    const char* file;
    const char* function;
    long line;
    wxString text;
};

namespace {

const char* NameOf(int level) {
    if (level <= LevelInformation)
        return "INFO ";
    return level == LevelWarning ? "WARN " : "ERROR";
}

/// UTF-8, or at least something: a record with a doubtful letter says more than an empty one.
wxString Text(const char* text) {
    if (!text)
        return {};
    wxString decoded = wxString::FromUTF8(text);
    return decoded.empty() ? wxString(text, wxConvISO8859_1) : decoded;
}

} // namespace

LogRecord::LogRecord(SeverityLevel level, const char* file, const char* function, long line)
    : m_content(new Content{level, file, function, line, {}}) {}

LogRecord::LogRecord(LogRecord&&) noexcept = default;

LogRecord::~LogRecord() {
    if (!m_content || !Log::Wants(m_content->level))
        return;
    try {
        wxString line = wxDateTime::UNow().Format("%Y-%m-%d %H:%M:%S.%l ");
        line << NameOf(m_content->level) << " [" << wxGetProcessId() << "] "
             << Text(m_content->file).AfterLast('/').AfterLast('\\') << ':' << m_content->line
             << ' ' << Text(m_content->function) << ": " << m_content->text;
        Log::Write(m_content->level, OneLine(line).utf8_string() + '\n');
    } catch (const std::bad_alloc&) { // a record is no reason to end the process
        Log::Write(m_content->level, "A log record was lost: out of memory.\n");
    }
}

LogRecord& LogRecord::operator<<(const char* text) {
    m_content->text << Text(text);
    return *this;
}

LogRecord& LogRecord::operator<<(const wxString& text) {
    m_content->text << text;
    return *this;
}

LogRecord SetLevelAndGetLogger(SeverityLevel level, const char* file, const char* function,
                               long line) {
    return {level, file, function, line};
}
