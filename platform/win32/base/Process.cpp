#include "platform/win32/text/Utf8.h"

#include <windows.h>

#include <chrono>
#include <fstream>
#include <string>
#include <thread>

namespace {

/// Writes one argument so that splitting the line by Windows' rules gives it back.
std::wstring Quote(const std::wstring& argument) {
    if (!argument.empty() && argument.find_first_of(L" \t\"") == std::wstring::npos)
        return argument;
    std::wstring quoted = L"\"";
    std::size_t backslashes = 0;
    for (const wchar_t character : argument) {
        if (character == L'"')
            quoted.append(backslashes + 1, L'\\'); // a quote, and the backslashes in front of it
        backslashes = character == L'\\' ? backslashes + 1 : 0;
        quoted += character;
    }
    return quoted.append(backslashes, L'\\') + L'"';
}

std::wstring ReadCommandLine() {
    std::ifstream file("/proc/self/cmdline", std::ios::binary);
    std::wstring line;
    for (std::string argument; std::getline(file, argument, '\0');) {
        if (!line.empty())
            line += L' ';
        line += Quote(win32::FromUtf8(argument));
    }
    return line;
}

} // namespace

LPWSTR WINAPI GetCommandLineW() {
    static std::wstring line = ReadCommandLine();
    return line.data();
}

void WINAPI Sleep(DWORD milliseconds) {
    std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds));
}
