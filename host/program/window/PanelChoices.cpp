#include "host/program/window/PanelChoices.h"

#include "host/program/settings/Settings.h"
#include "machine/Printers.h"
#include "plugin/interface/ControlIds.h"
#include "plugin/settings/FilterSettings.h"

#include <wx/choice.h>
#include <wx/intl.h>
#include <wx/sizer.h>

#include <algorithm>

namespace {

constexpr const char* PrinterKey = FilterSettings::Printer.key;
constexpr const char* ProfileKey = FilterSettings::DistillerProfile.key;
constexpr std::size_t LongestName = 40; // letters; what follows a name is to be seen

wxString Shortened(const wxString& name) {
    return name.length() <= LongestName ? name
                                        : name.Left(LongestName - 1) + wxString(wxUniChar(0x2026));
}

bool HasPrinter(const wxString& name) {
    const std::vector<Printer> printers = ListPrinters();
    return std::any_of(printers.begin(), printers.end(),
                       [&name](const Printer& printer) { return printer.name == name; });
}

wxString Marked(const wxString& name, bool isThere) {
    return wxString::Format(isThere ? _("%s (not PostScript)") : _("%s (not available)"),
                            Shortened(name));
}

bool Lacks(const wxChoice* choice, const wxString& name) {
    return choice && !name.empty() && choice->FindString(name) == wxNOT_FOUND;
}

/// Gives the choice the width for its entry, and has the sizers of the panel know.
void GiveRoom(const wxWindow& panel, wxChoice* choice, const wxString& entry) {
    const int width = choice->GetSizeFromTextSize(choice->GetTextExtent(entry).x).x;
    choice->SetMinSize(wxSize(std::max(width, choice->GetMinWidth()), choice->GetMinHeight()));
    for (wxWindow* around = choice->GetParent(); around != panel.GetParent();
         around = around->GetParent())
        if (wxSizer* const sizer = around->GetSizer())
            sizer->SetSizeHints(around);
}

} // namespace

PanelChoices::PanelChoices(wxWindow& panel, const Settings& settings) : m_panel(panel) {
    CompletePrinters(settings.Value(PrinterKey));
    CompleteProfiles(settings.Value(ProfileKey));
}

void PanelChoices::CompletePrinters(const wxString& chosen) {
    auto* const choice = dynamic_cast<wxChoice*>(m_panel.FindWindow(ControlId::Printer));
    if (!Lacks(choice, chosen))
        return;
    Add(PrinterKey, choice, Marked(chosen, HasPrinter(chosen)), chosen);
    choice->SetSelection(m_entries.back().index);
}

void PanelChoices::CompleteProfiles(const wxString& chosen) {
    auto* const choice = dynamic_cast<wxChoice*>(m_panel.FindWindow(ControlId::DistillerProfile));
    if (!choice)
        return;
    const bool lacksChosen = Lacks(choice, chosen);
    Add(ProfileKey, choice, _("None"), wxEmptyString);
    if (lacksChosen)
        Add(ProfileKey, choice, Marked(chosen, false), chosen);
    if (lacksChosen || chosen.empty()) // of which the panel knows nothing to select
        choice->SetSelection(m_entries.back().index);
}

void PanelChoices::Add(const char* key, wxChoice* choice, const wxString& text,
                       const wxString& value) {
    m_entries.push_back({key, choice, choice->Append(text), value});
    GiveRoom(m_panel, choice, text);
}

void PanelChoices::Correct(SettingsValues& values) const {
    for (const Entry& entry : m_entries)
        if (entry.choice->GetSelection() == entry.index)
            values[entry.key] = entry.value;
}
