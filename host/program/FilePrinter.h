#pragma once

#include <filesystem>

/// The PostScript printer of the host's own, which prints to files: a machine needs no other.
constexpr const wchar_t* FilePrinterName = L"Quillon PostScript File Printer";

/// Puts the file printer into the spooler, if it is not there yet. The log says when that fails.
/// @param ppd the file that describes it
void AddFilePrinter(const std::filesystem::path& ppd);
