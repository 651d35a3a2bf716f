#include "host/program/journal/SqliteClaim.h"

#include <algorithm>
#include <tuple>

using namespace std::chrono_literals;

namespace {

struct FolderRow {
    bool paused = false;
    JournalTime served; ///< when a document was begun last; each time a later one
};

using FolderRows = std::map<wxString, FolderRow>;

/// The job of a folder that comes first.
struct Head {
    std::int64_t id = 0;
    wxString folder;
    int priority = 0;
    JournalTime inserted;
    JournalTime served; ///< the folder

    /// For how many minutes the folder has waited for its turn.
    long long MinutesWaited(JournalTime now) const {
        const JournalTime since = std::max(inserted, served);
        return std::max<long long>(
            0, std::chrono::duration_cast<std::chrono::minutes>(now - since).count());
    }

    bool ComesBefore(const Head& other, JournalTime now) const {
        const long long mine = priority + MinutesWaited(now);
        const long long others = other.priority + other.MinutesWaited(now);
        return std::tie(others, served, id) < std::tie(mine, other.served, other.id);
    }
};

FolderRows ReadFolders(SqliteDatabase& database) {
    FolderRows folders;
    SqliteStatement rows(database, "SELECT name, paused, served FROM folder");
    while (rows.Next()) {
        FolderRow& folder = folders[rows.Text()];
        folder.paused = rows.Integer() != 0;
        folder.served = rows.Time();
    }
    return folders;
}

/// One that was changed in the future was so before the clock was set back. It may be due only
/// then, and is not left to wait for that.
std::optional<Head> HeadOf(SqliteDatabase& database, const ClaimableFolder& folder,
                           JournalTime now) {
    SqliteStatement row(database,
                        std::string("SELECT id, priority, inserted FROM job WHERE state='waiting' "
                                    "AND folder=?1 AND (due<=?2 OR changed>?3) ORDER BY ") +
                            (folder.byName ? "source, id" : "id") + " LIMIT 1",
                        folder.name, now, now + 1s);
    if (!row.Next())
        return std::nullopt;
    Head head;
    head.id = row.Integer();
    head.folder = folder.name;
    head.priority = static_cast<int>(row.Integer());
    head.inserted = row.Time();
    return head;
}

JournalTime LastServed(const FolderRows& folders) {
    JournalTime last;
    for (const auto& [name, folder] : folders)
        last = std::max(last, folder.served);
    return last;
}

} // namespace

std::optional<std::int64_t>
ChooseJob(SqliteDatabase& database, const std::vector<ClaimableFolder>& folders, JournalTime now) {
    FolderRows rows = ReadFolders(database);
    if (rows[wxString()].paused)
        return std::nullopt;
    std::optional<Head> first;
    for (const ClaimableFolder& folder : folders) {
        if (rows[folder.name].paused)
            continue;
        std::optional<Head> head = HeadOf(database, folder, now);
        if (!head)
            continue;
        head->served = rows[folder.name].served;
        if (!first || head->ComesBefore(*first, now))
            first = std::move(head);
    }
    if (!first)
        return std::nullopt;
    SqliteStatement(database,
                    "INSERT INTO folder (name, served) VALUES (?1, ?2) "
                    "ON CONFLICT (name) DO UPDATE SET served=excluded.served",
                    first->folder, std::max(now, LastServed(rows) + 1ms))
        .Run();
    return first->id;
}
