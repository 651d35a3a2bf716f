#include "host/program/report/Progress.h"

#include "host/program/system/Interruption.h"
#include "host/services/OneLine.h"

#include <wx/intl.h>

#include <algorithm>

namespace {

constexpr int BarWidth = 20;
// Letters may be two columns wide, and a terminal has 80.
constexpr std::size_t LongestName = 16;
constexpr std::size_t LongestText = 44;

wxString Shortened(const wxString& text, std::size_t length) {
    return text.length() <= length ? text : text.Left(length - 1) + wxString(wxUniChar(0x2026));
}

} // namespace

wxString ProgressLine(int percent, const wxString& text) {
    const int filled = percent * BarWidth / 100;
    return wxString::Format("[%s%s] %3d %%  %s", wxString('#', filled),
                            wxString('.', BarWidth - filled), percent,
                            Shortened(text, LongestText));
}

wxString TimeLeft(std::chrono::steady_clock::duration passed, std::size_t done, std::size_t all) {
    using namespace std::chrono;
    if (done == 0 || passed < 1s)
        return {};
    const auto left = duration_cast<seconds>(passed).count() *
                      static_cast<std::int64_t>(all - done) / static_cast<std::int64_t>(done);
    return wxString::Format(_("%lld:%02lld left"), static_cast<long long>(left / 60),
                            static_cast<long long>(left % 60));
}

bool Progress::Report(const wxString& text, int percent) {
    const int bounded = std::clamp(percent, 0, 100);
    // A step that only repeats which document it is says nothing new.
    const bool isItsName = text.Contains(m_document) || m_document.StartsWith(text);
    const wxString step = isItsName ? wxString() : OneLine(text);
    if (m_reporter.ForTerminal())
        m_reporter.Passing(
            ProgressLine(bounded, Shortened(OneLine(m_document), LongestName) + "  " + step));
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
