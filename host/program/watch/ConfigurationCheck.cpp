#include "host/program/watch/ConfigurationCheck.h"

#include "host/program/base/PathText.h"
#include "host/program/journal/Journal.h"
#include "host/program/report/Readiness.h"
#include "host/program/watch/FolderCheck.h"
#include "host/program/watch/FreeSpace.h"
#include "host/program/watch/Quantities.h"
#include "host/services/OneLine.h"

#include <wx/filename.h>
#include <wx/intl.h>

namespace fs = std::filesystem;

namespace {

class Check {
public:
    explicit Check(Reporter& reporter) : m_reporter(reporter) {}

    void Tell(const FolderConfiguration& folder);
    void Tell(const Fault& problem, const wxString& folder = {});
    ExitCode Finish(std::size_t folders);

private:
    Reporter& m_reporter;
    std::size_t m_problems = 0;
};

wxString HowSeen(const FolderCheck::Sight& sight) {
    return sight.tellsOfChanges ? _("they are seen when they come")
                                : _("they are looked for every few seconds, since the system does "
                                    "not tell of changes there");
}

wxString HowSettled(const FolderConfiguration& folder, const FolderCheck::Sight& sight) {
    wxString format;
    switch (sight.writers) {
    case WritersKnown::OfAll:
        format =
            _("they are begun when they have stayed the same for %s and nobody has them open to "
              "write");
        break;
    case WritersKnown::OfOwn:
        format =
            _("they are begun when they have stayed the same for %s and nobody has them open to "
              "write, which is not known of those of other users");
        break;
    case WritersKnown::OfNone:
        format = _("they are begun when they have stayed the same for %s; whether somebody has "
                   "them open to write is not known there");
        break;
    }
    return wxString::Format(format, TimeText(SettleTime(folder, sight.isOnShare)));
}

wxString SettingsOf(const FolderConfiguration& folder) {
    wxString list = folder.settings ? Shown(*folder.settings) : wxString();
    for (const std::string& assignment : folder.assignments)
        list << (list.empty() ? "" : ", ") << OneLine(wxString::FromUTF8(assignment));
    return list.empty() ? _("standard settings") : wxString::Format(_("settings: %s"), list);
}

wxString HowKept(const FolderConfiguration& folder) {
    return folder.keepProcessed ? wxString::Format(_("they are kept for %s when they are done"),
                                                   TimeText(*folder.keepProcessed))
                                : _("they are kept when they are done");
}

const char* NameOf(WritersKnown writers) {
    switch (writers) {
    case WritersKnown::OfAll:
        return "all";
    case WritersKnown::OfOwn:
        return "own";
    case WritersKnown::OfNone:
        break;
    }
    return "none";
}

/// What the system can tell of a folder's files, as it stands in the folder's record.
Json RecordOf(const FolderCheck::Sight& sight) {
    return {{"share", sight.isOnShare},
            {"events", sight.tellsOfChanges},
            {"writers", NameOf(sight.writers)},
            {"watchedBy", sight.watchedBy ? Json(JsonText(*sight.watchedBy)) : Json()}};
}

void Check::Tell(const FolderConfiguration& folder) {
    const FolderCheck check = CheckFolder(folder);
    m_reporter.Line(OneLine(folder.name));
    std::vector<wxString> lines = {wxString::Format(_("documents in %s"), Shown(folder.in))};
    if (check.sight) {
        lines.push_back(HowSeen(*check.sight));
        lines.push_back(HowSettled(folder, *check.sight));
        if (check.sight->watchedBy)
            lines.push_back(wxString::Format(_("at the moment they are watched for by %s"),
                                             OneLine(*check.sight->watchedBy)));
    }
    lines.insert(lines.end(), {HowKept(folder), SettingsOf(folder),
                               wxString::Format(_("output in %s"), Shown(folder.out))});
    if (folder.print)
        lines.push_back(
            wxString::Format(_("printed in the queue %s"), OneLine(folder.print->ticket.queue)));
    for (const wxString& line : lines)
        m_reporter.Line("  " + line);
    const std::chrono::duration<double> settle =
        SettleTime(folder, check.sight && check.sight->isOnShare);
    m_reporter.Record(
        {{"type", "folder"},
         {"name", JsonText(folder.name)},
         {"in", folder.in.u8string()},
         {"out", folder.out.u8string()},
         {"queue", folder.print ? Json(JsonText(folder.print->ticket.queue)) : Json()},
         {"settings", folder.settings ? Json(folder.settings->u8string()) : Json()},
         {"set", folder.assignments},
         {"settle", settle.count()},
         {"sight", check.sight ? RecordOf(*check.sight) : Json()}});
    for (const Fault& problem : check.problems)
        Tell(problem, folder.name);
    if (folder.print)
        if (const auto problem = Spooler(folder.print->ticket.server).Check(folder.print->ticket))
            Tell(*problem, folder.name);
}

void Check::Tell(const Fault& problem, const wxString& folder) {
    ++m_problems;
    const wxString line = wxString::Format(_("Problem: %s"), OneLine(problem.Text()));
    m_reporter.Line(folder.empty() ? line : "  " + line);
    m_reporter.Record({{"type", "problem"},
                       {"folder", folder.empty() ? Json() : Json(JsonText(folder))},
                       {"text", JsonText(problem.what)},
                       {"advice", JsonText(problem.advice)}});
}

ExitCode Check::Finish(std::size_t folders) {
    const ExitCode exitCode = m_problems == 0 ? ExitCode::Done : ExitCode::WrongUsage;
    const auto count = static_cast<unsigned>(m_problems);
    m_reporter.Line(m_problems == 0
                        ? _("All is well.")
                        : wxString::Format(wxPLURAL("%u problem.", "%u problems.", count), count));
    m_reporter.Record({{"type", "summary"},
                       {"folders", folders},
                       {"problems", m_problems},
                       {"exitCode", static_cast<int>(exitCode)}});
    return exitCode;
}

/// The folder, or the nearest one above it that is there.
fs::path NearestOf(fs::path folder) {
    std::error_code error;
    while (!fs::exists(folder, error) && folder.has_relative_path())
        folder = folder.parent_path();
    return folder;
}

/// Why nothing could be kept of what is known of documents.
std::optional<Fault> FindObstacleOfQueue(const WatchConfiguration& configuration) {
    Fault fault; // one without tables will have them made by the watch
    try {
        const std::unique_ptr<Journal> queue =
            OpenJournal(configuration.journal, fault, JournalNeed::Make, configuration.map);
        return queue ? std::nullopt : std::optional(fault);
    } catch (const JournalError& error) {
        return Fault{
            wxString::Format(_("the journal cannot be used: %s"), wxString::FromUTF8(error.what())),
            Blame::Machine};
    }
}

/// The same of a journal in a file.
std::optional<Fault> FindObstacleOfJournal(const fs::path& journal) {
    const fs::path folder = NearestOf(journal.parent_path());
    if (!wxFileName::IsDirWritable(ToText(folder)))
        return Fault{wxString::Format(_("the journal %s cannot be written: nothing can be written "
                                        "to %s"),
                                      Shown(journal), Shown(folder)),
                     Blame::Usage, ConversionFailed,
                     _("Name another file as journal, or let this user write there")};
    if (IsShare(folder))
        return Fault{wxString::Format(_("the journal %s lies on a share, where it may be damaged"),
                                      Shown(journal)),
                     Blame::Usage, ConversionFailed, _("Name a file on a disk of this machine")};
    std::error_code error;
    Fault fault;
    if (!fs::exists(journal, error) || OpenJournal(journal.u8string(), fault, JournalNeed::Visit))
        return std::nullopt;
    return fault;
}

/// Where documents need room.
std::vector<fs::path> PlacesOf(const WatchConfiguration& configuration) {
    std::error_code ignored;
    std::vector<fs::path> places = {fs::temp_directory_path(ignored)};
    if (!IsQueueUrl(configuration.journal))
        places.push_back(NearestOf(FromArgument(configuration.journal).parent_path()));
    for (const FolderConfiguration& folder : configuration.folders)
        places.push_back(NearestOf(folder.out));
    return places;
}

} // namespace

ExitCode TellCheck(const WatchConfiguration& configuration, const FilterSet& filters,
                   Reporter& reporter, const std::vector<Fault>& problems) {
    Check check(reporter);
    for (const FolderConfiguration& folder : configuration.folders)
        check.Tell(folder);
    for (const Fault& problem : problems)
        check.Tell(problem);
    for (const Fault& missing : FindMissing(filters, false))
        check.Tell(missing);
    const bool isShared = IsQueueUrl(configuration.journal);
    if (const auto obstacle = isShared ? FindObstacleOfQueue(configuration)
                                       : FindObstacleOfJournal(FromArgument(configuration.journal)))
        check.Tell(*obstacle);
    if (const auto shortage = FindShortage(PlacesOf(configuration), configuration.minFree))
        check.Tell(*shortage);
    return check.Finish(configuration.folders.size());
}
