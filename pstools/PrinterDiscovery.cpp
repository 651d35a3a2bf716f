#include "pstools/PrinterDiscovery.h"

#include "machine/Printers.h"

bool FindDistillerPrinter(wxString& printerName) {
    for (const Printer& printer : ListPrinters()) {
        if (printer.IsDistiller()) {
            printerName = printer.name;
            return true;
        }
    }
    return false;
}

void ListPostScriptPrinters(wxArrayString& printers) {
    for (const Printer& printer : ListPrinters())
        if (printer.IsPostScript())
            printers.Add(printer.name);
}
