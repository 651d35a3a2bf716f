#pragma once

#include <wx/string.h>

#include <chrono>

/// The system's manager of services, where it has started this program and wants to be told how it
/// is. Where there is none, nothing happens.
namespace ServiceManager {

/// The program does what it was started for.
void TellReady();

/// One line for people who look at the service.
void TellStatus(const wxString& status);

/// The program is alive: it has got round all that it looks after.
void TellAlive();

/// The program reads its configuration anew, until TellReady.
void TellReloading();

/// The program ends when what is under way is finished, which may take as long again.
/// @param more from now on
void TellStopping(std::chrono::seconds more);

/// Within what time TellAlive is wanted.
/// @return zero where it is not
std::chrono::milliseconds WatchdogPeriod();

} // namespace ServiceManager
