#include "tests/host/Program.h"

#include "tests/support/Wine.h"

#include <windows.h>
// After it, which it takes for granted.
#include <wx/string.h>

#include <gtest/gtest.h>
#include <tlhelp32.h>

namespace {

HANDLE HandleOf(std::intptr_t process) {
    return reinterpret_cast<HANDLE>(process); // NOLINT(performance-no-int-to-ptr)
}

HANDLE OpenForChild(const wchar_t* name, DWORD access, DWORD disposition) {
    SECURITY_ATTRIBUTES inherited = {sizeof inherited, nullptr, TRUE};
    return CreateFileW(name, access, FILE_SHARE_READ | FILE_SHARE_WRITE, &inherited, disposition,
                       FILE_ATTRIBUTE_NORMAL, nullptr);
}

/// The argument such that a program finds it again in its command line: backslashes count where a
/// quotation mark follows.
std::wstring Quoted(const std::wstring& argument) {
    std::wstring quoted = L"\"";
    std::size_t backslashes = 0;
    for (const wchar_t letter : argument) {
        if (letter == L'"')
            quoted.append(backslashes + 1, L'\\');
        backslashes = letter == L'\\' ? backslashes + 1 : 0;
        quoted += letter;
    }
    return quoted.append(backslashes, L'\\') + L'"';
}

/// A console of its own, so that it can be told Ctrl-C and nobody else is.
BOOL Start(std::wstring commandLine, STARTUPINFOW& startup, PROCESS_INFORMATION& process) {
    return CreateProcessW(nullptr, commandLine.data(), nullptr, nullptr, TRUE, CREATE_NEW_CONSOLE,
                          nullptr, nullptr, &startup, &process);
}

BOOL WINAPI NotMeant(DWORD /*event*/) {
    return TRUE;
}

/// Sends an event to the process, and to whatever shares its console.
void Send(DWORD event, std::intptr_t process) {
    // Not the switch that ignores Ctrl-C, which processes started from here would inherit.
    static const BOOL isSafe = SetConsoleCtrlHandler(NotMeant, TRUE);
    ASSERT_TRUE(isSafe);
    FreeConsole();
    ASSERT_TRUE(AttachConsole(GetProcessId(HandleOf(process)))) << "error " << GetLastError();
    EXPECT_TRUE(GenerateConsoleCtrlEvent(event, 0)) << "error " << GetLastError();
    FreeConsole();
    AttachConsole(ATTACH_PARENT_PROCESS);
}

} // namespace

RunningProgram::RunningProgram(const std::vector<std::string>& command) {
    const std::filesystem::path out = m_folder / "out";
    const std::filesystem::path err = m_folder / "err";
    std::wstring commandLine;
    for (const std::string& argument : command)
        commandLine += Quoted(wxString::FromUTF8(argument).ToStdWstring()) + L' ';
    STARTUPINFOW startup = {};
    startup.cb = sizeof startup;
    startup.dwFlags = STARTF_USESTDHANDLES | STARTF_USESHOWWINDOW;
    startup.wShowWindow = SW_HIDE;
    startup.hStdInput = OpenForChild(L"NUL", GENERIC_READ, OPEN_EXISTING);
    startup.hStdOutput = OpenForChild(out.c_str(), GENERIC_WRITE, CREATE_NEW);
    startup.hStdError = OpenForChild(err.c_str(), GENERIC_WRITE, CREATE_NEW);
    PROCESS_INFORMATION process = {};
    if (Start(commandLine, startup, process)) {
        CloseHandle(process.hThread);
        m_process = reinterpret_cast<std::intptr_t>(process.hProcess);
    } else {
        ADD_FAILURE() << command[0] << ": error " << GetLastError();
    }
    for (HANDLE file : {startup.hStdInput, startup.hStdOutput, startup.hStdError})
        CloseHandle(file);
}

RunningProgram::~RunningProgram() {
    if (m_process == None)
        return;
    TerminateProcess(HandleOf(m_process), 1);
    WaitForSingleObject(HandleOf(m_process), INFINITE);
    CloseHandle(HandleOf(m_process));
}

void RunningProgram::Interrupt() const {
    Send(CTRL_C_EVENT, m_process);
}

void RunningProgram::Terminate() const {
    Send(RunsOnWine() ? CTRL_C_EVENT : CTRL_BREAK_EVENT, m_process); // Wine lacks the other
}

bool RunningProgram::HasEnded() const {
    return WaitForSingleObject(HandleOf(m_process), 0) == WAIT_OBJECT_0;
}

int RunningProgram::ExitCode() {
    if (m_process == None)
        return -1;
    DWORD exitCode = 0;
    WaitForSingleObject(HandleOf(m_process), INFINITE);
    GetExitCodeProcess(HandleOf(m_process), &exitCode);
    CloseHandle(HandleOf(m_process));
    m_process = None;
    return static_cast<int>(exitCode);
}

bool IsQuillonRunningWith(const std::string& /*argument*/) {
    HANDLE processes = CreateToolhelp32Snapshot(TH32CS_SNAPPROCESS, 0);
    PROCESSENTRY32W process = {};
    process.dwSize = sizeof process;
    bool found = false;
    for (BOOL more = Process32FirstW(processes, &process); more && !found;
         more = Process32NextW(processes, &process))
        found = wxString(process.szExeFile).IsSameAs("quillon.exe", false);
    CloseHandle(processes);
    return found;
}
