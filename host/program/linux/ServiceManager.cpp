#include "host/program/system/ServiceManager.h"

#include <systemd/sd-daemon.h>

#include <algorithm>
#include <cstdint>
#include <ctime>
#include <string>

namespace {

void Tell(const std::string& state) {
    sd_notify(0, state.c_str());
}

/// Of the clock that the manager compares by.
std::uint64_t MonotonicMicroseconds() {
    timespec now = {};
    clock_gettime(CLOCK_MONOTONIC, &now);
    const std::chrono::nanoseconds time =
        std::chrono::seconds(now.tv_sec) + std::chrono::nanoseconds(now.tv_nsec);
    return static_cast<std::uint64_t>(
        std::chrono::duration_cast<std::chrono::microseconds>(time).count());
}

} // namespace

void ServiceManager::TellReady() {
    Tell("READY=1");
}

void ServiceManager::TellStatus(const wxString& status) {
    std::string line = status.utf8_string();
    std::replace(line.begin(), line.end(), '\n', ' '); // what follows one would say something else
    Tell("STATUS=" + line);
}

void ServiceManager::TellAlive() {
    Tell("WATCHDOG=1");
}

void ServiceManager::TellReloading() {
    Tell("RELOADING=1\nMONOTONIC_USEC=" + std::to_string(MonotonicMicroseconds()));
}

void ServiceManager::TellStopping(std::chrono::seconds more) {
    const std::chrono::microseconds time(more);
    Tell("STOPPING=1\nEXTEND_TIMEOUT_USEC=" + std::to_string(time.count()));
}

std::chrono::milliseconds ServiceManager::WatchdogPeriod() {
    std::uint64_t microseconds = 0;
    if (sd_watchdog_enabled(0, &microseconds) <= 0)
        return {};
    return std::chrono::duration_cast<std::chrono::milliseconds>(
        std::chrono::microseconds(microseconds));
}
