#include "tests/host/System.h"

#include <windows.h>
// After it, which it takes for granted.
#include <tlhelp32.h>

void System::StopThisProcess() {
    HANDLE threads = CreateToolhelp32Snapshot(TH32CS_SNAPTHREAD, 0);
    THREADENTRY32 entry = {};
    entry.dwSize = sizeof entry;
    for (BOOL more = Thread32First(threads, &entry); more; more = Thread32Next(threads, &entry)) {
        if (entry.th32OwnerProcessID != GetCurrentProcessId() ||
            entry.th32ThreadID == GetCurrentThreadId())
            continue;
        HANDLE thread = OpenThread(THREAD_SUSPEND_RESUME, FALSE, entry.th32ThreadID);
        SuspendThread(thread);
        CloseHandle(thread);
    }
    CloseHandle(threads);
    SuspendThread(GetCurrentThread());
}

void System::EndThisProcess() {
    TerminateProcess(GetCurrentProcess(), 1);
}
