#include "host/program/page/Health.h"

#include "host/program/journal/Machines.h"
#include "host/program/page/Wording.h"

#include <algorithm>

namespace {

constexpr auto LongestPass = std::chrono::seconds(10);

wxString IllnessOf(const FolderStatus& folder, bool isPaused, const Texts& texts) {
    const wxString name = OneLine(folder.configuration.name);
    if (!folder.reachable && folder.obstacle.empty())
        return wxString::Format(texts(wxTRANSLATE("folder %s cannot be reached")), name);
    if (!folder.obstacle.empty())
        return wxString::Format(texts(wxTRANSLATE("folder %s: %s")), name,
                                OneLine(folder.obstacle));
    if (isPaused)
        return wxString::Format(texts(wxTRANSLATE("folder %s is paused")), name);
    return {};
}

} // namespace

bool IsPaused(const wxString& folder, const WatchStatus& status, const JournalExtract& journal) {
    if (journal.fault.empty())
        return journal.paused.count(folder) > 0;
    return std::any_of(status.folders.begin(), status.folders.end(),
                       [&folder](const FolderStatus& each) {
                           return each.paused && each.configuration.name == folder;
                       });
}

std::vector<wxString> ReasonsOfIllness(const WatchStatus& status, const JournalExtract& journal,
                                       std::chrono::steady_clock::time_point now,
                                       const Texts& texts) {
    std::vector<wxString> reasons;
    const bool hasLooked = status.lastPass != std::chrono::steady_clock::time_point();
    if (!hasLooked)
        reasons.push_back(texts(wxTRANSLATE("the folders have not been looked at yet")));
    else if (now - status.lastPass > LongestPass)
        reasons.push_back(wxString::Format(
            texts(wxTRANSLATE("the folders were last looked at %s ago")),
            DurationText(std::chrono::duration<double>(now - status.lastPass).count(), texts)));
    if (!status.journalFault.empty())
        reasons.push_back(OneLine(status.journalFault));
    else if (!journal.fault.empty())
        reasons.push_back(OneLine(journal.fault));
    if (status.draining)
        reasons.push_back(
            texts(wxTRANSLATE("the service is ending: what is under way is finished first")));
    if (IsPaused("", status, journal))
        reasons.push_back(texts(wxTRANSLATE("all folders are paused")));
    if (journal.machines &&
        std::none_of(journal.machines->begin(), journal.machines->end(), Converts))
        reasons.push_back(texts(wxTRANSLATE("no machine converts documents: start `quillon serve` "
                                            "on one of them")));
    if (!hasLooked) // how folders are is not known yet
        return reasons;
    for (const FolderStatus& folder : status.folders) {
        const wxString reason =
            IllnessOf(folder, IsPaused(folder.configuration.name, status, journal), texts);
        if (!reason.empty())
            reasons.push_back(reason);
    }
    return reasons;
}
