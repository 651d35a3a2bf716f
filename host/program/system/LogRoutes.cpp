#include "host/program/system/LogRoutes.h"

#include "common/WQServices.h"

#include <wx/debug.h>
#include <wx/log.h>

namespace {

SeverityLevel SeverityOf(wxLogLevel level) {
    if (level <= wxLOG_Error)
        return LevelError;
    return level == wxLOG_Warning ? LevelWarning : LevelInformation;
}

const char* OrUnknown(const char* text) {
    return text ? text : "wxWidgets";
}

class ToolkitLog : public wxLog {
protected:
    void DoLogRecord(wxLogLevel level, const wxString& message,
                     const wxLogRecordInfo& info) override {
        SetLevelAndGetLogger(SeverityOf(level), OrUnknown(info.filename), OrUnknown(info.func),
                             info.line)
            << message;
    }
};

void LogAssertion(const wxString& file, int line, const wxString& function,
                  const wxString& condition, const wxString& message) {
    SetLevelAndGetLogger(LevelError, file.utf8_str(), function.utf8_str(), line)
        << "Assertion failed: " << condition << ' ' << message;
}

} // namespace

void RouteToolkitLog() {
    wxLog::EnableLogging(); // a program without a window starts without
    delete wxLog::SetActiveTarget(new ToolkitLog);
    wxSetAssertHandler(LogAssertion);
}
