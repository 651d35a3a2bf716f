#pragma once

#include <wx/arrstr.h>
#include <wx/string.h>

/// Finds the printer of the Acrobat Distiller driver; the spooler's first, when there are several.
/// @param printerName receives its name; stays as it was when there is none
/// @return whether there is one
bool FindDistillerPrinter(wxString& printerName);

/// Lists the printers whose driver is described by a PPD file: the PostScript printers.
/// @param printers their names are appended, in the spooler's order
void ListPostScriptPrinters(wxArrayString& printers);
