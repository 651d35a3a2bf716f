#include "host/program/system/Interruption.h"

#include "host/program/system/ChildProcess.h"

#include <windows.h>

#include <atomic>
#include <cstring>
#include <string>

namespace {

std::atomic<bool> g_requested{false};

std::atomic<const char*> g_note{nullptr};

void WriteNote() {
    DWORD written = 0;
    if (const char* const note = g_note)
        WriteFile(GetStdHandle(STD_ERROR_HANDLE), note, static_cast<DWORD>(std::strlen(note)),
                  &written, nullptr);
}

bool IsKey(DWORD kind) {
    return kind == CTRL_C_EVENT || kind == CTRL_BREAK_EVENT;
}

/// The window closes or the user logs off: the process ends when the handler returns, and by force
/// a few seconds later. Until then the document under way may be finished.
BOOL AwaitForce() {
    Sleep(INFINITE);
    return TRUE;
}

/// Runs on a thread of the system's, like the next.
BOOL WINAPI OnRequest(DWORD kind) {
    const bool again = g_requested.exchange(true);
    if (!IsKey(kind))
        return AwaitForce();
    if (again)
        EndThisProcess(static_cast<int>(STATUS_CONTROL_C_EXIT)); // as the system says it
    WriteNote();
    return TRUE;
}

BOOL WINAPI LeaveRequest(DWORD kind) {
    return IsKey(kind) || AwaitForce();
}

} // namespace

void Interruption::Install() {
    SetConsoleCtrlHandler(OnRequest, TRUE);
}

void Interruption::EndAtOnce() {
    SetConsoleCtrlHandler(OnRequest, FALSE);
    if (Requested())
        EndThisProcess(static_cast<int>(STATUS_CONTROL_C_EXIT));
}

void Interruption::SetNote(const wxString& note) {
    static std::string s_line;
    g_note = nullptr;
    s_line = "\nquillon: " + note.utf8_string() + '\n';
    g_note = s_line.c_str();
}

void Interruption::LeaveToParent() {
    SetConsoleCtrlHandler(LeaveRequest, TRUE);
    SetConsoleCtrlHandler(nullptr, TRUE); // nor is Ctrl-C for the processes started from here
}

bool Interruption::Requested() {
    return g_requested;
}

// A window that is closed ends its programs here, and nothing else means to read anew.

void Interruption::ReloadOnHangUp() {}

bool Interruption::ReloadRequested() {
    return false;
}
