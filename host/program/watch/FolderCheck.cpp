#include "host/program/watch/FolderCheck.h"

#include "host/program/base/PathText.h"
#include "host/program/documents/OutputFolder.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/system/FileIdentity.h"
#include "host/program/system/FolderBell.h"
#include "host/program/watch/FolderLock.h"
#include "host/program/watch/FolderScan.h"

#include <wx/filename.h>
#include <wx/intl.h>

namespace fs = std::filesystem;

namespace {

Fault Problem(const wxString& what, const wxString& advice) {
    return {what, Blame::Machine, ConversionFailed, advice};
}

/// The device that a folder's files are on, links followed.
std::optional<std::uint64_t> DeviceOf(const fs::path& folder) {
    std::error_code error;
    const FileLook look = LookAt(fs::canonical(folder, error), error);
    return error ? std::nullopt : std::optional(look.identity.device);
}

std::optional<Fault> FindObstacleOfInput(const fs::path& in) {
    std::error_code error;
    const fs::directory_iterator entries(in, error);
    if (error)
        return Problem(wxString::Format(_("%s cannot be seen: %s"), Shown(in), Because(error)),
                       _("Make the folder, mount the share, or let this user read it"));
    if (!wxFileName::IsDirWritable(ToText(in)))
        return Problem(
            wxString::Format(_("nothing can be written to %s"), Shown(in)),
            _("Let this user write to it: documents that are done are moved to a folder in it"));
    return std::nullopt;
}

/// @param name of a folder that sources are put away to
std::optional<Fault> FindObstacleOfPutAway(const fs::path& in, const char* name) {
    const fs::path folder = in / name;
    std::error_code error;
    if (!fs::exists(folder, error))
        return std::nullopt; // it will be made
    if (!fs::is_directory(folder, error) || !wxFileName::IsDirWritable(ToText(folder)))
        return Problem(wxString::Format(_("nothing can be put into %s"), Shown(folder)),
                       _("Make it a folder that this user can write to"));
    if (DeviceOf(folder) != DeviceOf(in))
        return Problem(
            wxString::Format(_("%s is on another device than the folder it lies in"),
                             Shown(folder)),
            _("Have both on one: documents are moved from one to the other in a single step"));
    return std::nullopt;
}

std::optional<Fault> FindObstacleOfOutput(const fs::path& out) {
    const wxString obstacle = OutputFolder::FindObstacle(out);
    if (obstacle.empty())
        return std::nullopt;
    return Fault{
        wxString::Format(_("the output folder %s cannot be used: %s"), Shown(out), obstacle),
        Blame::Usage};
}

std::optional<Fault> FindObstacleOfSettings(const FolderConfiguration& folder) {
    SettingsOptions options;
    if (folder.settings)
        options.file = folder.settings->u8string();
    options.assignments = folder.assignments;
    Fault fault;
    return MakeRunSettings(options, fault) ? std::nullopt : std::optional(fault);
}

} // namespace

FolderCheck CheckFolder(const FolderConfiguration& folder) {
    FolderCheck check;
    const auto note = [&check](const std::optional<Fault>& problem) {
        if (problem)
            check.problems.push_back(*problem);
        return !problem;
    };
    if (note(FindObstacleOfInput(folder.in))) {
        const bool isOnShare = IsShare(folder.in);
        check.sight = {isOnShare, !isOnShare && FolderBell().Watch(folder.in),
                       WritersKnownIn(folder.in), FolderLock::HolderOf(folder.in)};
        for (const char* const name : {ProcessedFolder, FailedFolder})
            note(FindObstacleOfPutAway(folder.in, name));
    }
    note(FindObstacleOfOutput(folder.out));
    note(FindObstacleOfSettings(folder));
    return check;
}
