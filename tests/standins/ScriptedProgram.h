#pragma once

#include <filesystem>
#include <string>

/// Writes a program that does what a shell script says in the place of an engine. An engine starts
/// no process and has no programs, so the script is left with the shell's own commands; as its last
/// one it may become a program by "exec": sleep, ln, mkfifo or truncate.
/// @param tools a folder that the engine may read; gets the shell and the programs
void WriteScriptedProgram(const std::filesystem::path& path, const std::filesystem::path& tools,
                          const std::string& script);
