#include "host/program/Arguments.h"

#include <windows.h>

#include <shellapi.h>
#include <wx/string.h>

#include <memory>

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
