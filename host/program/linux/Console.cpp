#include "host/program/system/Console.h"

#include <langinfo.h>
#include <unistd.h>

#include <clocale>
#include <cstring>

bool IsTerminal(std::FILE* stream) {
    return isatty(fileno(stream)) != 0;
}

void UseUtf8() {
    std::setlocale(LC_MESSAGES, "");
    if (!std::setlocale(LC_CTYPE, "") || std::strcmp(nl_langinfo(CODESET), "UTF-8") != 0)
        std::setlocale(LC_CTYPE, "C.UTF-8"); // a bare machine has only "C", which is ASCII
}

std::vector<std::string> Arguments(int argc, const char* const* argv) {
    return {argv + (argc > 0 ? 1 : 0), argv + argc};
}
