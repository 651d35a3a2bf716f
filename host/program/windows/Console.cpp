#include "host/program/system/Console.h"

#include <windows.h>

#include <wx/string.h>

#include <fcntl.h>
#include <io.h>
#include <shellapi.h>

#include <memory>

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

std::vector<std::string> Arguments(int /*argc*/, const char* const* /*argv*/) {
    // Those of main have lost what the system's code page lacks.
    int count = 0;
    const std::unique_ptr<LPWSTR, decltype(&LocalFree)> line(
        CommandLineToArgvW(GetCommandLineW(), &count), LocalFree);
    std::vector<std::string> arguments;
    for (int i = 1; i < count; ++i)
        arguments.push_back(wxString(line.get()[i]).utf8_string());
    return arguments;
}
