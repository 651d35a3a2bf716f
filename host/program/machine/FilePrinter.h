#pragma once

#include "machine/Printers.h"

#include <filesystem>

/// The PostScript printer of the host's own, which prints to files: a machine needs no other.
constexpr const wchar_t* FilePrinterName = L"Quillon PostScript File Printer";

/// Puts the file printer into the spooler, if it is not there yet. The log says when that fails.
/// @param ppd the file that describes it
void AddFilePrinter(const std::filesystem::path& ppd);

/// The printer that documents are printed on when nobody asks for another.
/// @return the Distiller printer, which filters take even when somebody does; else the file printer
/// of the host; else the first PostScript printer; else null
const Printer* PreferredPrinter(const std::vector<Printer>& printers);
