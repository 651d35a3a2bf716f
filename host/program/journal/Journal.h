#pragma once

#include "host/program/journal/Job.h"
#include "host/program/journal/PathMap.h"

#include <map>
#include <memory>
#include <set>
#include <stdexcept>
#include <string>
#include <vector>

/// The journal cannot be read or written at the moment. Whoever uses it catches it where a pass of
/// work begins, so that what could not be told is told later.
class JournalError : public std::runtime_error {
public:
    using std::runtime_error::runtime_error; ///< UTF-8, in the library's words
};

/// Somebody else has claimed a job since, or it is gone: whoever had it has nothing to do with it
/// any more.
class JobLost : public std::runtime_error {
public:
    JobLost() : std::runtime_error("the job is somebody else's, or gone") {}
};

/// A document that has settled in a watched folder.
struct NewJob {
    wxString folder;
    std::filesystem::path source;
    wxString inside;
    FileIdentity identity;
    int priority = 50;
    std::string digest{}; ///< see Job
};

/// A watched folder whose documents may be begun.
struct ClaimableFolder {
    wxString name;
    bool byName = false; ///< its documents' order; otherwise that of their arrival
};

/// Who claims.
struct Claimant {
    wxString name;                  ///< one for each program that is running
    std::chrono::seconds lease{30}; ///< for how long without a heartbeat
    /// Extensions of documents that it has nothing to convert with; in lower case, without dots.
    /// Only a shared journal has anybody else for them.
    std::set<std::string> cannot{};
};

/// Which jobs are asked for; what is not set asks for all.
struct JobQuery {
    std::optional<wxString> folder;
    std::optional<JobState> state;
    std::optional<bool> open;
    std::optional<JournalTime> endedBefore;
    bool newestFirst = false; ///< by their last change; otherwise as they are to be begun
    std::size_t limit = 1000;
};

/// How much there is of a folder.
struct FolderCounts {
    std::map<JobState, std::size_t> jobs;
    std::optional<JournalTime> oldestWaiting; ///< inserted
};

class SharedJournal;

/// What is known of the documents of watched folders, kept where it survives. Each call is one
/// transaction, which is on the disk when the call returns. All throw JournalError. An object is
/// for one thread; any number of objects and programs may have the same journal open.
class Journal {
public:
    virtual ~Journal() = default;

    /// Enters documents. One whose file an open job has already is passed over.
    /// @return how many were new
    virtual std::size_t Insert(const std::vector<NewJob>& jobs) = 0;

    /// Takes the next document whose time has come and makes it Converting, its attempt counted.
    /// Within a folder the first one found, or by name, comes first. Between folders those of the
    /// higher priority, which grows by 1 for each minute in which the folder was not served, and
    /// among equals those that were not served for longest.
    /// @return nothing when there is none
    virtual std::optional<Job> Claim(const std::vector<ClaimableFolder>& folders,
                                     const Claimant& claimant) = 0;

    /// Says that the claimant still has jobs.
    /// @param jobs the numbers of all that it knows of: what it was given without hearing of it, as
    ///     the connection broke, is let go
    virtual void Heartbeat(const Claimant& claimant, const std::vector<std::int64_t>& jobs) = 0;

    /// Stores all that has changed of a job, but what it is of.
    /// @return false when somebody else has claimed it since, or it is gone: nothing is stored then
    virtual bool Commit(const Job& job) = 0;

    /// The jobs of folders that somebody left under way, from Converting to Delivering, and those
    /// whose sources are to be put away. Each is the claimant's from here on. Where nobody but the
    /// folder's watcher works on them, all there are were left; in a shared journal, those whose
    /// lease has run out.
    virtual std::vector<Job> TakeOver(const std::vector<wxString>& folders,
                                      const Claimant& claimant) = 0;

    virtual std::vector<Job> List(const JobQuery& query) = 0;
    /// By the folders' names.
    virtual std::map<wxString, FolderCounts> Counts() = 0;

    /// Has a job that has failed, and whose file is put away, tried again from there, as new.
    /// @return false when there is no such job
    virtual bool Retry(std::int64_t id) = 0;

    /// Forgets a job.
    virtual void Remove(std::int64_t id) = 0;

    /// Has no documents of a folder begun, or of any, until that is taken back.
    /// @param folder its name; empty for all
    virtual void SetPaused(const wxString& folder, bool paused) = 0;
    /// Names of folders as above.
    virtual std::set<wxString> Paused() = 0;

    /// What its clock says.
    virtual JournalTime Now() = 0;

    /// What programs on several machines say to each other by it.
    /// @return null when it is this machine's alone. It lives as long as the journal.
    virtual SharedJournal* Shared() { return nullptr; }
};

/// Stores all that has changed of a job.
/// @throw JobLost when nothing is stored
void Store(const Job& job, Journal& journal);

/// What becomes of a journal that is not there, or damaged.
enum class JournalNeed {
    Make,  ///< it is begun anew; a damaged one is set aside before, under a name that says so
    Visit, ///< it stays so, and cannot be opened
};

/// Opens a journal.
/// @param where a file's path, UTF-8, or the URL of a queue (IsQueueUrl)
/// @param fault receives why it cannot be opened. One of a later version of the program is left
///     alone.
/// @param map how the paths of a queue are called on this machine
std::unique_ptr<Journal> OpenJournal(const std::string& where, Fault& fault,
                                     JournalNeed need = JournalNeed::Make, const PathMap& map = {});

/// Whether a journal is one that machines share, on a PostgreSQL server: postgres://…
bool IsQueueUrl(const std::string& where);

/// A journal's name for people: a password in it is left out.
wxString ShownJournal(const std::string& where);

/// The user's journal, where no other is named. UTF-8.
std::string StandardJournal();
