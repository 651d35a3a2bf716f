#pragma once

#include "host/program/base/Fault.h"

#include <string>

/// How a PostgreSQL server is connected to, so that no call on it takes much longer than ten
/// seconds, whatever becomes of it or of the network. What the URL itself says has precedence.
/// @param fault receives why the URL is none; never with what stands in it, which may be a password
/// @return for libpq; empty when there is a fault
std::string ConnectionOptions(const std::string& url, Fault& fault);

/// Whether a server answers there, whomever it lets in.
bool AnswersAt(const std::string& options);
