#include "host/program/journal/Journal.h"

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

bool IsQueueUrl(const std::string& where) {
    return where.rfind("postgres://", 0) == 0 || where.rfind("postgresql://", 0) == 0;
}

std::string StandardJournal() {
    return (UserStateFolder() / "quillon" / "journal.db").u8string();
}
