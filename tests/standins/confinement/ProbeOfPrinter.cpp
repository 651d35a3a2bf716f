// Loaded into the program that prints what an engine made, in front of Poppler: it takes the
// program over when it turns to the document.

#include "tests/standins/confinement/Attempts.h"

#include <unistd.h>

#include <cstdlib>

extern "C" void* poppler_document_new_from_fd(int file, const char* password, void** error);

extern "C" void* poppler_document_new_from_fd(int /*file*/, const char* /*password*/,
                                              void** /*error*/) {
    const char* const targets = std::getenv("TARGETS");
    const std::string outcomes = Attempt(targets ? targets : "");
    const bool isWritten = write(STDOUT_FILENO, outcomes.data(), outcomes.size()) > 0;
    std::_Exit(isWritten ? EXIT_SUCCESS : EXIT_FAILURE);
}
