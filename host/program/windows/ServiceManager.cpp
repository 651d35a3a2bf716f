#include "host/program/system/ServiceManager.h"

// The program is not a service of this system's: nobody asks how it is.

void ServiceManager::TellReady() {}

void ServiceManager::TellStatus(const wxString& /*status*/) {}

void ServiceManager::TellAlive() {}

void ServiceManager::TellReloading() {}

void ServiceManager::TellStopping(std::chrono::seconds /*more*/) {}

std::chrono::milliseconds ServiceManager::WatchdogPeriod() {
    return {};
}
