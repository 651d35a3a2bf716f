#pragma once

#include <cstdio>

/// Whether a person at a terminal reads the stream.
bool IsTerminal(std::FILE* stream);

/// Makes UTF-8 the encoding of file names and of text that goes in and out, whatever the
/// environment says. Before anything else of the program.
void UseUtf8();
