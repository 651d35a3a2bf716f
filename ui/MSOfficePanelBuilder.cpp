#include "ui/MSOfficePanelBuilder.h"

#include "common/Translated.h"
#include "pstools/DistillerDiscovery.h"
#include "pstools/PrinterDiscovery.h"
#include "ui/CWndDCPluginNamePanel.h"
#include "ui/InputFileType.h"
#include "ui/MSOfficePanel.h"
#include "ui/NotePanel.h"
#include "ui/OutputFileType.h"
#include "ui/PanelFit.h"
#include "ui/PowerPointSettings.h"

#include <wx/sizer.h>

namespace {

constexpr int SpaceAboveNote = 40;

/// What the user still has to do on this machine.
const char* NoteFor(bool officeInstalled, bool hasPrinter) {
    if (!officeInstalled)
        return "Install MS-Office in your computer to print MS-Office related files.";
    if (!hasPrinter)
        return "Install Acrobat Distiller or any PS-Printer.";
    return "Uncheck 'Rely on system fonts only' in the Adobe PDF Settings for successful "
           "printing.";
}

CWndDCPluginNamePanel* NewStrip(wxWindow* parent, const wxString& name) {
    auto* strip = new CWndDCPluginNamePanel(parent, wxID_ANY);
    strip->SetPluginName(name);
    return strip;
}

} // namespace

MSOfficePanel* BuildMSOfficePanel(wxWindow* parent, const wxString& vendorName,
                                  const wxString& inputTypes, bool controlsEnabled,
                                  bool officeInstalled) {
    // wxWidgets' checks know only flags that do something; some here do nothing in their sizer.
    wxSizerFlags::DisableConsistencyChecks();

    wxArrayString profiles;
    GetDistillerProfiles(profiles);
    wxArrayString printers;
    ListPostScriptPrinters(printers);

    auto* panel = new MSOfficePanel(parent, controlsEnabled);
    auto* top = new wxBoxSizer(wxVERTICAL);
    top->Add(NewStrip(panel, vendorName), 0, wxEXPAND | wxALIGN_CENTER, 0);
    top->Add(InputFileTypeFunc(panel, false, false, inputTypes), 0, wxEXPAND | wxALL, 5);
    top->Add(PowerPointSettingsFunc(panel, false, false), 0, wxEXPAND | wxALL, 5);
    top->Add(OutputFileTypeFunc(panel, false, false), 0, wxEXPAND | wxALL, 5);
    top->Add(0, SpaceAboveNote, 0, 0, 0);
    const wxString note = Translated(NoteFor(officeInstalled, !printers.empty()));
    top->Add(CreateNotePanel(panel, note), 0, wxEXPAND | wxALIGN_BOTTOM | wxALL, 0);
    panel->SetSizer(top);
    top->SetSizeHints(panel);

    panel->SetDistillerProfiles(profiles);
    panel->SetPrinters(printers);
    panel->SetupControls();
    FitToTexts(panel);
    panel->TransferDataToWindow();
    return panel;
}
