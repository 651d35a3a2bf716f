#include "office/PrintJob.h"

#include "pstools/PSRepair.h"
#include "pstools/PrinterDiscovery.h"

PSOutput::PSOutput(const wxFileName& document, const wxString& outputFolder)
    : fileName(document.GetName() + ".ps"),
      path(outputFolder + wxFileName::GetPathSeparator() + fileName) {}

wxString ChoosePrinter(const wxString& configured) {
    wxString distiller;
    return FindDistillerPrinter(distiller) ? distiller : configured;
}

ResultCode RepairOutput(const PSOutput& output) {
    switch (RepairPSHeader(output.path)) {
    case PSRepair::CannotOpen:
        return Result::OutputFileNotFound;
    case PSRepair::NoHeader:
        return Result::NoPSHeader;
    default:
        return Result::Success;
    }
}
