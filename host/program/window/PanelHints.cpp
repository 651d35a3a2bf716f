#include "host/program/window/PanelHints.h"

#include "plugin/interface/ControlIds.h"

#include <wx/intl.h>
#include <wx/window.h>

#include <set>

namespace {

struct Hint {
    int id;
    const char* text; ///< in English
};

constexpr const char* OfHandouts = wxTRANSLATE("For handouts only: choose these under Print.");
constexpr const char* OfProfiles =
    wxTRANSLATE("How Distiller makes PDF files; None: in its own way. For PDF only.");

constexpr Hint Hints[] = {
    {ControlId::Printer, wxTRANSLATE("The printer whose driver writes the PostScript files. Where "
                                     "there is a Distiller printer, it is that one.")},
    {ControlId::Print,
     wxTRANSLATE("What is printed of a presentation: its slides, several of them on a page, slides "
                 "with the speaker's notes, or their text alone.")},
    {ControlId::Colour, wxTRANSLATE("Pure black and white leaves no shades of gray.")},
    {ControlId::HandoutsHeading, OfHandouts},
    {ControlId::SlidesPerPageLabel, OfHandouts},
    {ControlId::SlidesPerPage, OfHandouts},
    {ControlId::OrderLabel, OfHandouts},
    {ControlId::OrderHorizontal,
     wxTRANSLATE("The slides of a page run across it, row by row. For handouts only.")},
    {ControlId::OrderVertical,
     wxTRANSLATE("The slides of a page run down it, column by column. For handouts only.")},
    {ControlId::ScaleToFitPaper,
     wxTRANSLATE("Slides are made larger or smaller to fill the paper.")},
    {ControlId::FrameSlides, wxTRANSLATE("Each slide has a thin line around it.")},
    {ControlId::HighQuality,
     wxTRANSLATE("Shadows and transparency are printed as finely as PowerPoint can. Needs "
                 "PowerPoint 2007 or a later one.")},
    {ControlId::OutputPS, wxTRANSLATE("A PostScript file is made of each document.")},
    {ControlId::OutputPDF,
     wxTRANSLATE("A PDF file is made of each PostScript file. Needs a Distiller profile on this "
                 "machine.")},
    {ControlId::DistillerProfileLabel, OfProfiles},
    {ControlId::DistillerProfile, OfProfiles},
};

/// Some systems let the mouse through a disabled control: its parent then speaks for it.
void SpeakForDisabled(wxWindow* parent) {
    parent->Bind(wxEVT_MOTION, [parent](wxMouseEvent& event) {
        event.Skip();
        wxString text;
        for (const wxWindow* const child : parent->GetChildren())
            if (!child->IsEnabled() && child->GetRect().Contains(event.GetPosition()))
                text = child->GetToolTipText();
        if (text != parent->GetToolTipText())
            parent->SetToolTip(text);
    });
}

} // namespace

void ExplainControls(wxWindow& panel) {
    std::set<wxWindow*> parents;
    for (const Hint& hint : Hints)
        if (wxWindow* const control = panel.FindWindow(hint.id)) {
            control->SetToolTip(wxGetTranslation(hint.text));
            parents.insert(control->GetParent());
        }
    for (wxWindow* const parent : parents)
        SpeakForDisabled(parent);
}
