#pragma once

#include <cstdio>
#include <string>
#include <vector>

/// Whether a person at a terminal reads the stream.
bool IsTerminal(std::FILE* stream);

/// Makes UTF-8 the encoding of file names and of text that goes in and out, whatever the
/// environment says. Before anything else of the program.
void UseUtf8();

/// The program's arguments without its own name, as UTF-8, or as whatever bytes the system has let
/// into a file name.
std::vector<std::string> Arguments(int argc, const char* const* argv);
