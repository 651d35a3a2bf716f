#pragma once

#include "host/program/machine/Printers.h"

#include <wx/string.h>

#include <vector>

/// An Office application that filters can use.
struct OfficeApplication {
    wxString name;
    wxString progId;
    bool installed = false;
    wxString version; ///< the registered one, "16"; may be empty even when installed
    wxString advice;  ///< what to do to have it; empty when it is installed
};

/// Something without which documents cannot be converted.
struct MissingPart {
    wxString what;
    wxString advice; ///< what to do about it
};

/// What the machine has to convert documents with.
struct MachineStatus {
    std::vector<OfficeApplication> applications;
    wxString engine; ///< what stands behind them, with its version; empty when there is none
    std::vector<Printer> printers;
    wxString pdfEngine; ///< what makes PDF files, with its version; empty when nothing does
    std::vector<wxString> profiles; ///< Distiller's
    std::vector<MissingPart> missing;
    wxString panelObstacle; ///< why the settings panel's controls are disabled; empty when not
};

MachineStatus LookAtMachine();
