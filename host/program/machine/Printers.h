#pragma once

#include <wx/string.h>

#include <filesystem>
#include <vector>

/// A printer as the spooler lists it.
struct Printer {
    wxString name;
    wxString driver;
    bool isDistiller = false;  ///< its driver is Acrobat Distiller's
    bool isPostScript = false; ///< its driver is described by a PPD file
};

/// The spooler's printers, in its order.
std::vector<Printer> ListPrinters();

/// The printer that documents are printed on when nobody asks for another.
/// @return the Distiller printer, else the file printer of the host, else the first PostScript
/// printer, else null
const Printer* PreferredPrinter(const std::vector<Printer>& printers);

/// The PostScript printer of the host's own, which prints to files: a machine needs no other.
constexpr const wchar_t* FilePrinterName = L"Quillon PostScript File Printer";

/// Puts the file printer into the spooler, if it is not there yet. The log says when that fails.
/// @param ppd the file that describes it
void AddFilePrinter(const std::filesystem::path& ppd);
