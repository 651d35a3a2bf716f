#pragma once

#include "host/program/base/Fault.h"
#include "machine/OfficeApplication.h"

#include <optional>

// What the machine lacks to convert documents, if anything, as it is at the moment, with the code
// by which filters report that. The facts are those that filters go by.

/// An Office application that can be driven: any of them.
std::optional<Fault> FindMissingOffice();
std::optional<Fault> FindMissingApplication(OfficeApplication application);
/// A PostScript printer.
std::optional<Fault> FindMissingPrinter();
/// What makes PDF files.
std::optional<Fault> FindMissingPdfMaker();
/// What keeps documents from the rest of the machine.
std::optional<Fault> FindMissingIsolation();
/// What files with the extension need to be printed.
/// @param extension without the dot; nothing is known of those that no Office application serves
std::optional<Fault> FindMissingFor(const wxString& extension);

/// What the controls of the filters' settings panels need: without it they are disabled.
std::optional<Fault> FindMissingForPanel();
