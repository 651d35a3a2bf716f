#include "host/program/Progress.h"

#include "host/program/Interruption.h"
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
    const wxString step = OneLine(text);
    if (m_reporter.ForTerminal()) {
        m_reporter.Passing(wxString::Format("%s %3d %%  %s  %s", Bar(bounded), bounded,
                                            Shortened(m_document, LongestName),
                                            Shortened(step, LongestStep)));
    } else {
        const wxString line = wxString::Format("%s: %d %%  %s", m_document, bounded, step);
        if (line != m_last)
            m_reporter.Line(line);
        m_last = line;
    }
    return !Interruption::Requested();
}
