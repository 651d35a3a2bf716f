#include "host/program/report/Progress.h"

#include "host/program/system/Interruption.h"
#include "host/services/OneLine.h"

#include <algorithm>

namespace {

constexpr int BarWidth = 20;
// Letters may be two columns wide, and a terminal has 80.
constexpr std::size_t LongestName = 16;
constexpr std::size_t LongestStep = 24;

wxString Shortened(const wxString& text, std::size_t length) {
    return text.length() <= length ? text : text.Left(length - 1) + wxString(wxUniChar(0x2026));
}

wxString Bar(int percent) {
    const int filled = percent * BarWidth / 100;
    return '[' + wxString('#', filled) + wxString('.', BarWidth - filled) + ']';
}

} // namespace

bool Progress::Report(const wxString& text, int percent) {
    const int bounded = std::clamp(percent, 0, 100);
    // A step that only repeats which document it is says nothing new.
    const wxString step = text.Contains(m_document) ? wxString() : OneLine(text);
    if (m_reporter.ForTerminal())
        m_reporter.Passing(wxString::Format("%s %3d %%  %s  %s", Bar(bounded), bounded,
                                            Shortened(OneLine(m_document), LongestName),
                                            Shortened(step, LongestStep)));
    else
        ReportLine(step, bounded);
    return !Interruption::Requested();
}

void Progress::ReportLine(const wxString& step, int percent) {
    const int quarter = percent / 25;
    if (quarter == m_lastQuarter && step == m_lastStep)
        return;
    m_lastQuarter = quarter;
    m_lastStep = step;
    m_reporter.Line(wxString::Format("%s: %d %%  %s", OneLine(m_document), percent, step).Trim());
}
