#include "host/program/watch/WatchReport.h"

#include "host/program/base/PathText.h"
#include "host/program/report/OutcomeReport.h"
#include "host/program/report/Progress.h"

#include <wx/intl.h>

void WatchReport::TellFolders(const WatchedFolders& folders) {
    for (const WatchedFolder& folder : folders) {
        const FolderConfiguration& configuration = *folder.Configuration();
        m_reporter.Line(wxString::Format(configuration.isOthers
                                             ? _("Working for %s; output goes to %s")
                                             : _("Watching %s; output goes to %s"),
                                         Shown(configuration.in), Shown(configuration.out)));
    }
}

void WatchReport::TellObstacles(const WatchedFolders& folders) {
    for (const WatchedFolder& folder : folders) {
        const std::optional<Fault> obstacle = folder.Obstacle();
        const wxString text = obstacle ? obstacle->Text() : wxString();
        wxString& told = m_obstacles[folder.Name()];
        if (text == told)
            continue;
        told = text;
        m_reporter.Line(folder.Name() + ": " + (text.empty() ? _("it goes on") : text));
    }
}

void WatchReport::Tell(const Job& job, const Outcome& outcome) {
    ++(job.state == JobState::Failed ? m_failed : m_done);
    ::Tell(outcome, m_reporter);
}

void WatchReport::ShowProgress(const WatchStatus& status, std::size_t waiting) {
    if (status.running.empty()) {
        m_burst = Clock::now();
        m_doneBefore = m_done + m_failed;
        return;
    }
    if (!m_reporter.ForTerminal() || !status.journalFault.empty())
        return;
    const std::size_t done = m_done + m_failed - m_doneBefore;
    const std::size_t all = done + status.running.size() + waiting;
    wxString text = wxString::Format(_("%zu of %zu"), done, all) + "  ";
    const wxString left = TimeLeft(Clock::now() - m_burst, done, all);
    text << (left.empty() ? left : left + "  ");
    for (const RunningDocument& document : status.running)
        text << document.name << (&document == &status.running.back() ? "" : ", ");
    m_reporter.Passing(ProgressLine(static_cast<int>(done * 100 / all), text));
}

wxString WatchReport::Line(const WatchStatus& status) const {
    wxString line = wxString::Format(_("%zu under way, %zu done, %zu failed"),
                                     status.running.size(), m_done, m_failed);
    if (!status.journalFault.empty())
        line << "; " << status.journalFault;
    for (const FolderStatus& folder : status.folders)
        if (!folder.obstacle.empty())
            line << "; " << folder.configuration.name << ": " << folder.obstacle;
    return line;
}
