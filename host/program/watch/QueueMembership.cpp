#include "host/program/watch/QueueMembership.h"

#include "common/WQServices.h"
#include "host/program/journal/Machines.h"
#include "host/program/watch/FolderAnnouncement.h"

#include <wx/intl.h>

#include <algorithm>

QueueMembership::~QueueMembership() {
    try {
        m_journal.TakeLeave(m_self.name);
    } catch (const JournalError& error) {
        SetLevelAndGetLogger(LevelInformation, __FILE__, __func__, __LINE__)
            << "The queue does not know that this machine ends: " << error.what();
    }
}

void QueueMembership::Announce(WatchedFolders& folders) {
    std::vector<AnnouncedFolder> announced;
    std::vector<wxString> all;
    for (WatchedFolder& folder : folders) {
        all.push_back(folder.Name());
        folder.ShowUntold({});
        if (!folder.View().hasLooked || folder.View().fault)
            continue; // it may be another watch's
        Fault fault;
        if (auto each = AnnouncementOf(*folder.Configuration(), m_map, fault))
            announced.push_back(std::move(*each));
        else
            folder.ShowUntold(fault);
    }
    if (announced != m_announced || all != m_all)
        m_journal.Announce(announced, m_finder, all);
    m_announced = std::move(announced);
    m_all = std::move(all);
}

std::optional<std::vector<FolderConfiguration>> QueueMembership::News() {
    std::vector<AnnouncedFolder> heard = m_journal.Announced();
    if (m_heard == heard)
        return std::nullopt;
    std::vector<FolderConfiguration> folders;
    m_refused.clear();
    for (const AnnouncedFolder& announced : heard) {
        Fault fault;
        if (std::optional<FolderConfiguration> folder = FolderOf(announced, m_map, fault)) {
            folders.push_back(std::move(*folder));
            continue;
        }
        m_refused << (m_refused.empty() ? "" : "; ") << announced.name << ": " << fault.Text();
        SetLevelAndGetLogger(LevelWarning, __FILE__, __func__, __LINE__)
            << "The folder " << announced.name << " is not worked for: " << fault.Text();
    }
    m_heard = std::move(heard);
    return folders;
}

void QueueMembership::Report(const WatchStatus& status) {
    m_self.running = status.running.size();
    m_self.obstacle = m_refused;
    for (const FolderStatus& folder : status.folders)
        if (!folder.obstacle.empty())
            m_self.obstacle << (m_self.obstacle.empty() ? "" : "; ") << folder.configuration.name
                            << ": " << folder.obstacle;
    m_self.cannot = m_claimant.cannot;
    m_journal.Report(m_self, m_claimant);
}

std::optional<Fault> FindMisfit(const PageMakers& makers, const std::vector<Machine>& machines) {
    const auto measure = std::find_if(machines.begin(), machines.end(), [](const Machine& machine) {
        return Converts(machine) && !machine.takesAnyVersion;
    });
    if (measure == machines.end() || measure->makers == makers)
        return std::nullopt;
    const PageMakers& others = measure->makers;
    wxString differences;
    const auto compare = [&differences](const wxString& what, const wxString& here,
                                        const wxString& there) {
        if (here != there)
            differences << (differences.empty() ? "" : "; ")
                        << wxString::Format(_("%s is %s here and %s there"), what, here, there);
    };
    const auto shown = [](const wxString& text) { return text.empty() ? _("none") : text; };
    compare("quillon", shown(makers.program), shown(others.program));
    compare(_("what opens documents"), shown(makers.office), shown(others.office));
    compare(_("what makes PDF"), shown(makers.pdf), shown(others.pdf));
    compare(_("the set of fonts"), shown(makers.fonts.Left(8)), shown(others.fonts.Left(8)));
    return Fault{wxString::Format(_("pages could look another way from this machine than from %s: "
                                    "%s"),
                                  measure->name, differences),
                 Blame::Usage, ConversionFailed,
                 _("Install the same on both, or say --any-version")};
}
