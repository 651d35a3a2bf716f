#pragma once

#include <sys/types.h>

#include <filesystem>
#include <functional>
#include <set>
#include <string>
#include <vector>

/// The engines whose home lies in a folder for temporary files, with what they have started.
std::vector<pid_t> EnginesIn(const std::filesystem::path& temporary);
/// Those of them that go by a name: "office-host" is a LibreOffice that is kept started,
/// "office-document" its child at work on a document.
std::vector<pid_t> EnginesIn(const std::filesystem::path& temporary, const std::string& name);
/// Kills a process, and waits until nothing of it is left: no file that it had open.
void EndForCertain(pid_t process);
/// The supervisors whose work folder lies there.
std::vector<pid_t> SupervisorsIn(const std::filesystem::path& temporary);

/// The sockets of LibreOffice in the system's folder for temporary files that belong to nobody any
/// more: what engines leave there when they are killed.
std::set<std::string> AbandonedSockets();

/// Waits until the condition holds.
/// @return false when it does not within ten seconds
bool Await(const std::function<bool()>& condition);
