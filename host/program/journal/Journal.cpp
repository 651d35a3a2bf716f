#include "host/program/journal/Journal.h"

#include "host/program/journal/SqliteJournal.h"
#include "host/program/system/StandardFiles.h"

std::unique_ptr<Journal> OpenJournal(const std::string& where, Fault& fault, JournalNeed need) {
    SqliteJournal::Options options;
    options.need = need;
    return SqliteJournal::Open(std::filesystem::absolute(std::filesystem::u8path(where)),
                               std::move(options), fault);
}

std::string StandardJournal() {
    return (UserStateFolder() / "quillon" / "journal.db").u8string();
}
