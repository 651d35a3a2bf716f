#include "host/program/Terminal.h"

#include <fcntl.h>
#include <io.h>
#include <windows.h>

bool IsTerminal(std::FILE* stream) {
    // Not every console draws by escape sequences, as the progress bar does.
    HANDLE console = GetStdHandle(stream == stderr ? STD_ERROR_HANDLE : STD_OUTPUT_HANDLE);
    DWORD mode = 0;
    return GetConsoleMode(console, &mode) &&
           SetConsoleMode(console, mode | ENABLE_VIRTUAL_TERMINAL_PROCESSING);
}

void UseUtf8() {
    SetConsoleOutputCP(CP_UTF8);
    for (std::FILE* const stream : {stdout, stderr})
        _setmode(_fileno(stream), _O_BINARY); // lines end as they do elsewhere
}
