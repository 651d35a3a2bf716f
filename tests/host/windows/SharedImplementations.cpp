#include "tests/host/JournalImplementation.h"

std::vector<JournalImplementation> SharedImplementations() {
    return {};
}
