#include "host/program/journal/Journal.h"

#include "host/program/base/PathText.h"
#include "host/program/journal/Queue.h"
#include "host/program/journal/SqliteJournal.h"
#include "host/program/system/StandardFiles.h"

std::unique_ptr<Journal> OpenJournal(const std::string& where, Fault& fault, JournalNeed need,
                                     const PathMap& map) {
    if (IsQueueUrl(where))
        return OpenQueue(where, fault, need, map);
    SqliteJournal::Options options;
    options.need = need;
    return SqliteJournal::Open(std::filesystem::absolute(std::filesystem::u8path(where)),
                               std::move(options), fault);
}

void Store(const Job& job, Journal& journal) {
    if (!journal.Commit(job))
        throw JobLost();
}

wxString ShownJournal(const std::string& where) {
    if (!IsQueueUrl(where))
        return Shown(std::filesystem::u8path(where));
    const std::size_t begin = where.find("://") + 3;
    const std::size_t end = where.find_last_of('@', where.find('/', begin));
    const std::size_t colon = where.find(':', begin);
    std::string shown = where.substr(0, where.find('?')); // parameters may hold one, too
    if (end != std::string::npos && end > begin && colon < end)
        shown.erase(colon, end - colon);
    return wxString::FromUTF8(shown);
}

bool IsQueueUrl(const std::string& where) {
    return where.rfind("postgres://", 0) == 0 || where.rfind("postgresql://", 0) == 0;
}

std::string StandardJournal() {
    return (UserStateFolder() / "quillon" / "journal.db").u8string();
}
