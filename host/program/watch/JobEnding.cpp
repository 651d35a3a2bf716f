#include "host/program/watch/JobEnding.h"

#include "host/program/base/PathText.h"
#include "host/program/documents/Delivery.h"
#include "host/program/system/DurableMove.h"
#include "host/program/watch/FailureNote.h"
#include "host/program/watch/FolderScan.h"
#include "host/program/watch/JobDecision.h"

#include <wx/filename.h>
#include <wx/intl.h>

#include <fstream>

namespace fs = std::filesystem;

namespace {

/// How many names are tried one after the other. Beyond, a folder has so many of the same name that
/// the job's number is put into it.
constexpr int MostNumbers = 20;

/// "letter", "letter (2)" and so on.
/// @param isTaken tells whether a name cannot be had
template <typename IsTaken>
wxString FreeName(const wxString& wanted, const Job& job, IsTaken isTaken) {
    wxString name = wanted;
    for (int number = 2; isTaken(name); ++number)
        name = number <= MostNumbers
                   ? wxString::Format("%s (%d)", wanted, number)
                   : wxString::Format("%s (%lld-%d)", wanted, static_cast<long long>(job.id),
                                      number - MostNumbers);
    return name;
}

/// Makes a folder, and those above it, below one that is there.
std::error_code MakeFolders(const fs::path& folder, const fs::path& below) {
    std::error_code error;
    if (folder == below || fs::is_directory(folder, error))
        return error;
    if ((error = MakeFolders(folder.parent_path(), below)))
        return error;
    fs::create_directory(folder, error);
    return error ? error : SyncFolder(folder.parent_path());
}

fs::path Inside(const fs::path& folder, const Job& job) {
    return job.inside.empty() ? folder : folder / FromText(job.inside);
}

bool IsThere(const fs::path& path) {
    std::error_code error;
    return fs::exists(fs::symlink_status(path, error));
}

/// Whether the file at the path is the job's. A share may be another device each time that it is
/// mounted.
bool IsSource(const Job& job, const fs::path& path) {
    std::error_code error;
    FileIdentity identity = LookAt(path, error).identity;
    identity.device = job.identity.device;
    return !error &&
           (job.digest.empty() ? identity == job.identity : MayBeSame(identity, job.identity));
}

std::error_code WriteDurably(const fs::path& file, const std::string& text) {
    fs::path passing = file.parent_path() / ("." + file.filename().u8string());
    passing += ".part";
    std::ofstream stream(passing, std::ios::binary | std::ios::trunc);
    stream << text;
    stream.close();
    if (!stream)
        return std::make_error_code(std::errc::io_error);
    return MoveDurably(passing, file);
}

/// Where a source goes: a name that neither a file nor a note has.
fs::path PlaceIn(const fs::path& folder, const Job& job) {
    const fs::path name = job.source.filename();
    if (!IsText(name)) { // no number can be put into it
        const fs::path place = folder / name;
        return IsThere(place) ? folder / (std::to_string(job.id) + "-" + name.u8string()) : place;
    }
    const wxFileName parts(ToText(name));
    const wxString ending = parts.HasExt() ? '.' + parts.GetExt() : wxString();
    const auto place = [&](const wxString& base) { return folder / FromText(base + ending); };
    return place(FreeName(parts.GetName(), job, [&](const wxString& base) {
        return IsThere(place(base)) || IsThere(NoteOf(place(base)));
    }));
}

Fault NotPutAway(const Job& job, const fs::path& to, const std::error_code& error) {
    return {wxString::Format(_("%s could not be moved to %s: %s"), Shown(job.source), Shown(to),
                             Because(error)),
            Blame::Machine};
}

void Close(Job& job, Journal& journal) {
    job.open = false;
    if (job.state == JobState::Finished)
        job.state = JobState::Archived;
    Store(job, journal);
}

} // namespace

std::optional<Fault> DeliverProduct(Job& job, const FolderConfiguration& folder, Journal& journal) {
    const Product product(job.workplace / FromText(job.product));
    const fs::path out = job.workplace.parent_path().parent_path(); // whatever is configured now
    const fs::path place = Inside(out, job);
    const wxString wanted = wxFileName(ToText(job.source.filename())).GetName();
    while (product.IsThere()) {
        if (const std::error_code error = MakeFolders(place, out))
            return Fault{wxString::Format(_("%s cannot be made: %s"), Shown(place), Because(error)),
                         Blame::Machine};
        const bool replaces = folder.onSameName == OnSameName::Replace;
        const wxString name = FreeName(wanted, job, [&](const wxString& base) {
            return !replaces && product.IsTaken(place, base);
        });
        const fs::path before = std::exchange(job.output, product.PlaceIn(place, name));
        Store(job, journal);
        std::optional<Fault> fault = product.MoveTo(place, name, replaces);
        if (fault && !product.IsThere() && !before.empty())
            job.output = before; // whoever had the job before was slow, and has moved it after all
        if (fault && product.IsThere() && (replaces || !IsThere(job.output)))
            return fault;
    }
    End(job, JobState::Finished, journal.Now());
    Store(job, journal);
    return std::nullopt;
}

std::optional<Fault> PutSourceAway(Job& job, const FolderConfiguration& folder, const Texts& texts,
                                   Journal& journal) {
    const bool hasFailed = job.state == JobState::Failed;
    const fs::path to = Inside(folder.in / (hasFailed ? FailedFolder : ProcessedFolder), job);
    const fs::path from = job.source;
    while (IsSource(job, from) && from.parent_path() != to) {
        if (const std::error_code error = MakeFolders(to, folder.in))
            return NotPutAway(job, to, error);
        job.aside = PlaceIn(to, job);
        Store(job, journal);
        const std::error_code error = MoveWithoutReplacing(from, job.aside);
        if (error && error != std::errc::file_exists)
            return NotPutAway(job, to, error);
        if (error)
            continue; // the name was taken meanwhile
        if (const std::error_code notSynced = SyncFolder(to))
            return NotPutAway(job, to, notSynced);
        if (const std::error_code notSynced = SyncFolder(from.parent_path()))
            return NotPutAway(job, to, notSynced);
    }
    if (!job.aside.empty() && IsSource(job, job.aside)) {
        std::error_code ignored;
        if (const std::error_code error =
                hasFailed ? WriteDurably(NoteOf(job.aside), NoteFor(job, folder.in, texts))
                          : std::error_code())
            return NotPutAway(job, NoteOf(job.aside), error);
        if (!hasFailed) // it may have been tried again from the folder of those that failed
            fs::remove(NoteOf(from), ignored);
        job.source = job.aside;
    }
    Close(job, journal);
    RemoveEmptyFolders(job, folder.in);
    return std::nullopt;
}

void RemoveEmptyFolders(const Job& job, const fs::path& in) {
    if (job.inside.empty())
        return;
    std::error_code error;
    for (fs::path folder = in / FromText(job.inside); folder != in && folder.has_relative_path();
         folder = folder.parent_path())
        if (!fs::remove(folder, error)) // one that is not empty stays
            return;
}
