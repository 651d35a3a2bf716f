#include "host/program/journal/PostgresJournal.h"
#include "host/program/journal/Queue.h"

std::unique_ptr<Journal> OpenQueue(const std::string& url, Fault& fault, JournalNeed need,
                                   const PathMap& map) {
    PostgresJournal::Options options;
    options.need = need;
    options.map = map;
    return PostgresJournal::Open(url, std::move(options), fault);
}
