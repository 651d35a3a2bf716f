#pragma once

#include <wx/string.h>

#include <vector>

/// A printer as the spooler lists it.
struct Printer {
    wxString name;
    wxString driver; ///< its name

    /// Whether the driver is Acrobat Distiller's.
    bool IsDistiller() const;

    /// Whether the driver is described by a PPD file. Asks the spooler.
    bool IsPostScript() const;
};

/// The spooler's printers, local ones and connections, in its order.
std::vector<Printer> ListPrinters();
