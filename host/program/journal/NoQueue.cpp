#include "host/program/journal/Queue.h"

#include <wx/intl.h>

std::unique_ptr<Journal> OpenQueue(const std::string& /*url*/, Fault& fault, JournalNeed /*need*/,
                                   const PathMap& /*map*/) {
    fault = {_("this program was built without the library for queues on a PostgreSQL server"),
             Blame::Usage, ConversionFailed,
             _("Use a journal in a file, or have a machine with Linux watch the folders")};
    return nullptr;
}
