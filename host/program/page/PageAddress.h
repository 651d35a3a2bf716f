#pragma once

#include "host/program/base/Fault.h"

#include <optional>
#include <string>

/// Where a page is served.
struct PageAddress {
    std::string host; ///< a name or a number, without brackets
    int port = 0;     ///< 0 for any that is free

    /// HOST:PORT, as browsers take it.
    std::string Text() const;

    /// Whether only this machine can reach it.
    bool IsLoopback() const;
};

/// @param text HOST:PORT; a number with colons stands in brackets
/// @param fault receives what is wrong with it
std::optional<PageAddress> ReadPageAddress(const std::string& text, Fault& fault);

/// The host that a request's header names, in lower case and without brackets and port.
/// @return nothing when there is none
std::optional<std::string> HostIn(const std::string& header);
