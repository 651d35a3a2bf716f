#include "common/Themer.h"
#include "plugin/interface/ControlIds.h"
#include "tests/ui/PanelFixture.h"
#include "ui/OutputFileType.h"

#include <wx/checkbox.h>
#include <wx/panel.h>
#include <wx/radiobut.h>
#include <wx/sizer.h>

#include <gmock/gmock.h>

namespace {

class PanelLayoutTest : public PanelFixture {};

bool ShowsTick(const wxWindow* window) {
    if (const auto* box = dynamic_cast<const wxCheckBox*>(window))
        return box->GetValue();
    if (const auto* button = dynamic_cast<const wxRadioButton*>(window))
        return button->GetValue();
    return false;
}

wxString Described(const wxWindow* window) {
    wxString line(window->GetClassInfo()->GetClassName());
    if (window->GetId() > 0)
        line << ' ' << window->GetId();
    if (const auto* choice = dynamic_cast<const wxChoice*>(window))
        line << " [" << wxJoin(choice->GetStrings(), '|', '\0') << ']';
    else if (!window->GetLabel().empty() && !dynamic_cast<const wxPanel*>(window))
        line << " \"" << window->GetLabel() << '"';
    if (!window->IsThisEnabled())
        line << " disabled";
    if (!window->IsShown())
        line << " hidden";
    if (ShowsTick(window))
        line << " ticked";
    return line;
}

/// The windows below `window`, one line each, indented by their depth: class, identifier, label or
/// entries, and what sets it apart (disabled, hidden, ticked). Identifiers that wxWidgets gave are
/// left out.
void AppendTree(const wxWindow* window, std::size_t depth, std::vector<std::string>& lines) {
    for (const wxWindow* child : window->GetChildren()) {
        lines.push_back(std::string(std::size_t{2} * depth, ' ') + Described(child).utf8_string());
        AppendTree(child, depth + 1, lines);
    }
}

const char* const WholeTree[] = {
    "wxPanel",
    "wxStaticText 17000 \"Input file type:\"",
    "wxStaticText 17001 \".doc, .docx, .xls, .xlsx, .ppt, .pptx, .pps, .ppsx, .pub\"",
    "wxStaticText 19000 \"Printer name:\"",
    "wxChoice 19001 [Adobe PDF|Proofer]",
    "wxStaticText \"PowerPoint settings\"",
    "wxPanel",
    "  wxPanel",
    "    wxStaticText 19002 \"Print:\"",
    "    wxChoice 19003 [Slides|Handouts|Notes Pages|Outline View]",
    "    wxStaticText 19004 \"Color/grayscale:\"",
    "    wxChoice 19005 [Color|Grayscale|Pure Black and White]",
    "    wxStaticText 19006 \"Handouts\" disabled",
    "    wxPanel 19007",
    "    wxStaticText 19008 \"Slides per page:\" disabled",
    "    wxChoice 19009 [1|2|3|4|6|9] disabled",
    "    wxStaticText 19010 \"No image\" disabled",
    "    wxStaticText 19011 \"Order:\" disabled",
    "    wxRadioButton 19012 \"Horizontal\" disabled ticked",
    "    wxRadioButton 19013 \"Vertical\" disabled",
    "    wxStaticText 19014 \"Advanced print options\"",
    "    wxPanel 19007",
    "    wxCheckBox 19015 \"Scale to fit paper\"",
    "    wxCheckBox 19016 \"Print hidden slides\" ticked",
    "    wxCheckBox 19017 \"Frame slides\"",
    "    wxCheckBox 19018 \"High quality\"",
    "    wxCheckBox 19019 \"Print comments and ink markup\" ticked",
    "wxStaticText \"Output file type\"",
    "wxPanel",
    "  wxPanel",
    "    wxRadioButton 13000 \"PS\" ticked",
    "    wxRadioButton 13001 \"PDF\"",
    "    wxStaticText 13004 \"Distiller profile:\" disabled",
    "    wxChoice 13005 [Press.joboptions|Print.joboptions] disabled",
    "wxPanel 19020",
    "  wxStaticText \"Note:\"",
    ("  wxStaticText \"Uncheck 'Rely on system fonts only' in the Adobe PDF Settings for "
     "successful printing.\""),
};

TEST_F(PanelLayoutTest, HoldsItsControlsInTheirOrder) {
    BuildPanel();
    std::vector<std::string> tree;
    AppendTree(m_panel, 0, tree);
    for (std::string& line : tree) // the note wraps where the font makes it
        std::replace(line.begin(), line.end(), '\n', ' ');
    EXPECT_THAT(tree, testing::ElementsAreArray(WholeTree));
}

TEST_F(PanelLayoutTest, WearsTheThemesColours) {
    BuildPanel();
    const Theme& theme = Themer::GetThemeService()->GetTheme("Default");
    EXPECT_EQ(theme.backgroundColour, m_panel->GetBackgroundColour());
    EXPECT_EQ(theme.borderColour, Find(ControlId::Print)->GetGrandParent()->GetBackgroundColour());
    EXPECT_EQ(Themer::GetThemeService()->GetTheme("Note").backgroundColour,
              Find(ControlId::NotePanel)->GetBackgroundColour());
    EXPECT_EQ(22, m_panel->GetChildren()[0]->GetMinHeight());
}

TEST_F(PanelLayoutTest, GivesABuildersParentItsSizerWhereAsked) {
    auto* parent = new wxFrame(nullptr, wxID_ANY, "Parent");
    const wxSizer* free = OutputFileTypeFunc(parent, true, false);
    EXPECT_EQ(nullptr, parent->GetSizer());
    delete free;
    parent->DestroyChildren();
    const wxSizer* given = OutputFileTypeFunc(parent, true, true);
    EXPECT_EQ(given, parent->GetSizer());
    EXPECT_GE(parent->GetMinWidth(), 250); // fitted to the profile choice
    parent->Destroy();
}

} // namespace
