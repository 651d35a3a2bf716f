#pragma once

#include "host/program/base/Fault.h"

#include <cups/cups.h>

#include <optional>
#include <string>

/// What a printer cannot do of what is asked for.
/// @param printer its attributes
std::optional<Fault> FindUnsupported(ipp_t* printer, const wxString& queue,
                                     const std::string& option, const std::string& value);
