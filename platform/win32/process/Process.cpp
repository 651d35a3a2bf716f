#include <windows.h>

#include <unistd.h>

#include <chrono>
#include <thread>

DWORD WINAPI GetCurrentProcessId() {
    return static_cast<DWORD>(getpid());
}

void WINAPI Sleep(DWORD milliseconds) {
    do
        std::this_thread::sleep_for(std::chrono::milliseconds(milliseconds));
    while (milliseconds == INFINITE);
}
