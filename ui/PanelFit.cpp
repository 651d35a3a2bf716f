#include "ui/PanelFit.h"

#include "plugin/interface/ControlIds.h"

#include <wx/choice.h>
#include <wx/sizer.h>

#include <algorithm>
#include <map>

namespace {

constexpr int MostLetters = 48; ///< of a choice; longer names end in an ellipsis

struct Row {
    int label;
    int control;
};

constexpr Row Rows[] = {
    {ControlId::PrinterLabel, ControlId::Printer},
    {ControlId::PrintLabel, ControlId::Print},
    {ControlId::ColourLabel, ControlId::Colour},
    {ControlId::SlidesPerPageLabel, ControlId::SlidesPerPage},
    {ControlId::OrderLabel, ControlId::OrderHorizontal},
    {ControlId::DistillerProfileLabel, ControlId::DistillerProfile},
};

constexpr struct {
    int id;
    int column; ///< of choices that have one width
} Choices[] = {
    {ControlId::Printer, 0},          {ControlId::Print, 1},
    {ControlId::Colour, 1},           {ControlId::SlidesPerPage, 2},
    {ControlId::DistillerProfile, 3},
};

int WidthFor(const wxChoice* choice) {
    int widest = 0;
    for (const wxString& entry : choice->GetStrings())
        widest = std::max(widest, choice->GetTextExtent(entry).x);
    widest = std::min(widest, MostLetters * choice->GetCharWidth());
    return std::max(choice->GetSizeFromTextSize(widest).x, choice->GetMinWidth());
}

/// Choices that stand one below the other get one width, and all of them one height: an empty one
/// believes that it needs less.
void GiveRoom(wxWindow* panel) {
    std::map<int, int> widths; // by column
    int height = 0;
    for (const auto& [id, column] : Choices) {
        const auto* choice = dynamic_cast<const wxChoice*>(panel->FindWindow(id));
        widths[column] = std::max(widths[column], WidthFor(choice));
        height = std::max(height, choice->GetBestSize().y);
    }
    for (const auto& [id, column] : Choices)
        panel->FindWindow(id)->SetMinSize(wxSize(widths[column], height));
}

/// Has the sizers of the panel and of the panels in it ask anew how much room they need, and lays
/// all of them out.
void FitSizers(wxWindow* panel) {
    for (wxWindow* child : panel->GetChildren())
        FitSizers(child);
    if (wxSizer* const sizer = panel->GetSizer()) {
        sizer->SetSizeHints(panel);
        panel->Layout();
    }
}

int LeftEdge(const wxWindow* panel, int id) {
    int left = 0;
    for (const wxWindow* window = panel->FindWindow(id); window != panel;
         window = window->GetParent())
        left += window->GetPosition().x;
    return left;
}

/// Makes the labels as wide as it takes.
void AlignRows(wxWindow* panel) {
    int column = 0;
    for (const Row& row : Rows)
        column = std::max(column, LeftEdge(panel, row.control));
    for (const Row& row : Rows) {
        wxWindow* const label = panel->FindWindow(row.label);
        const int missing = column - LeftEdge(panel, row.control);
        label->SetMinSize(wxSize(label->GetBestSize().x + missing, wxDefaultCoord));
    }
}

} // namespace

void FitToTexts(wxWindow* panel) {
    GiveRoom(panel);
    FitSizers(panel);
    AlignRows(panel);
    FitSizers(panel);
}
