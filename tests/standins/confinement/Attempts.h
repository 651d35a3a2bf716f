#pragma once

#include <string>

/// Tries everything that a document must not reach.
/// @param targets the folder of the user's, the port of a listener on this machine and the number
/// of a process, with spaces between; in the folder are the files "secret" and "other", the socket
/// "stream" with a listener and the socket "datagrams"
/// @return a line for each attempt: its name, and ": through" or ": refused"
std::string Attempt(const std::string& targets);
