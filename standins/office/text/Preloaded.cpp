// Makes of the files here a library that is loaded in front of those of a LibreOffice started for
// one document.

#include "standins/office/shared/TextLibraryNames.h"
#include "standins/office/text/DocumentPath.h"
#include "standins/office/text/FontUse.h"

#include <cstdlib>

namespace {

void WriteAtTheEnd() {
    standins::WriteFontUse(standins::FontUseFile);
}

__attribute__((constructor)) void Begin() {
    const char* known = std::getenv(standins::KnownPathVariable);
    const char* copy = std::getenv(standins::CopyVariable);
    if (known && copy)
        standins::SetDocumentPath(known, copy);
    standins::StartFontUse();
    std::atexit(WriteAtTheEnd);
}

} // namespace
