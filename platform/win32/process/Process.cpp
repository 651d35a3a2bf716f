#include <windows.h>

#include <unistd.h>

#include <chrono>
#include <thread>

DWORD WINAPI GetCurrentProcessId() {
    return static_cast<DWORD>(getpid());
}

void WINAPI Sleep(DWORD milliseconds) {
    const auto day = std::chrono::hours(24);
    while (milliseconds == INFINITE) // NOLINT(bugprone-infinite-loop): that is what it means
        std::this_thread::sleep_for(day);
    std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds));
}
