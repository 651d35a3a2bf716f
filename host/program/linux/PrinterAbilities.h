#pragma once

#include "host/program/system/Spooler.h"

#include <cups/cups.h>

class PrinterDescription;

/// What a printer cannot do of what is asked for.
/// @param printer its attributes
/// @param description null where there is none
std::optional<Fault> FindUnsupported(ipp_t* printer, const PrinterDescription* description,
                                     const wxString& queue, const std::string& option,
                                     const std::string& value);

/// What the printer calls paper of a size, whichever way it is turned; empty when it has none.
std::string MediaFor(ipp_t* printer, const PageSize& pages);
