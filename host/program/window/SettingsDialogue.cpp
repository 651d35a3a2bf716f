#include "host/program/window/SettingsDialogue.h"

#include "common/Themer.h"
#include "host/program/base/PathText.h"
#include "host/program/settings/ChoiceTexts.h"
#include "host/program/settings/RunSettings.h"
#include "host/program/window/MessageBar.h"
#include "host/program/window/PanelHints.h"
#include "host/program/window/ScrolledArea.h"
#include "plugin/interface/ControlIds.h"

#include <wx/button.h>
#include <wx/display.h>
#include <wx/intl.h>
#include <wx/settings.h>
#include <wx/sizer.h>
#include <wx/statline.h>
#include <wx/wupdlock.h>

#include <algorithm>

namespace {

constexpr int Margin = 10;       // all sizes in device-independent pixels
constexpr int ScreenMargin = 80; // room for the window's frame and the desktop's bars

} // namespace

SettingsDialogue::SettingsDialogue(const FilterSet& filters, const Settings& settings,
                                   const std::filesystem::path& file)
    : wxDialog(nullptr, wxID_ANY, Shown(file.filename()) + " - " + _("Print Settings"),
               wxDefaultPosition, wxDefaultSize, wxDEFAULT_DIALOG_STYLE | wxRESIZE_BORDER),
      m_filters(filters), m_file(file), m_area(new ScrolledArea(this)),
      m_obstacle(new MessageBar(this)), m_fault(new MessageBar(this)),
      m_focusWatch(*this, [this](wxWindow& control) { m_area->BringIntoView(control); }) {
    m_area->SetBackgroundColour(Themer::GetThemeService()->GetTheme("Default").backgroundColour);
    m_area->SetSizer(new wxBoxSizer(wxVERTICAL));
    m_fault->AddButton(ButtonId::Understood, _("OK"));
    auto* const top = new wxBoxSizer(wxVERTICAL);
    top->Add(m_obstacle, 0, wxEXPAND);
    top->Add(m_area, 1, wxEXPAND);
    top->Add(m_fault, 0, wxEXPAND);
    top->Add(new wxStaticLine(this), 0, wxEXPAND);
    top->Add(NewButtons(), 0, wxEXPAND | wxALL, FromDIP(Margin));
    ShowPanels(settings);
    SizePanels();
    ExplainObstacle();
    SetSizerAndFit(top);
    Bind(wxEVT_INIT_DIALOG, [](wxInitDialogEvent&) {}); // the panels show their values, and more
    Bind(wxEVT_BUTTON, &SettingsDialogue::OnSave, this, ButtonId::Save);
    Bind(wxEVT_BUTTON, &SettingsDialogue::OnRestore, this, ButtonId::Restore);
    Bind(wxEVT_BUTTON, &SettingsDialogue::OnUnderstood, this, ButtonId::Understood);
    Bind(wxEVT_CHAR_HOOK, &SettingsDialogue::OnKey, this);
    Bind(wxEVT_SIZE, &SettingsDialogue::OnSize, this);
    CentreOnScreen();
}

/// Shows a panel of each filter with these settings, in place of those that are there.
void SettingsDialogue::ShowPanels(const Settings& settings) {
    const wxWindowUpdateLocker still(m_area);
    wxSizer* const panels = m_area->GetSizer();
    m_choices.clear();
    panels->Clear(true);
    for (const auto& filter : m_filters.Filters())
        if (wxWindow* const panel = filter->CreatePanel(m_area, settings.Node())) {
            m_choices.emplace_back(*panel, settings);
            ExplainControls(*panel);
            panels->Add(panel, 0, wxEXPAND);
        }
    m_hasPanel = !panels->IsEmpty();
    m_area->TakeWheelFromChoices();
    m_area->FitInside();
}

/// Makes the area as large as the panels together, or as the screen allows.
void SettingsDialogue::SizePanels() {
    const wxSize wanted = m_area->GetSizer()->ComputeFittingClientSize(m_area);
    const wxSize screen = wxDisplay(this).GetClientArea().GetSize();
    const int margin = FromDIP(ScreenMargin);
    wxSize size = wanted;
    size.DecTo(screen - wxSize(margin, 2 * margin));
    if (size.y < wanted.y) // a scroll bar takes its width from the panels
        size.x += wxSystemSettings::GetMetric(wxSYS_VSCROLL_X, this);
    m_area->SetMinSize(size);
}

/// Says why the panels, or controls of theirs, are greyed out for good, if they are.
void SettingsDialogue::ExplainObstacle() {
    const std::optional<Fault> obstacle = FindMissingForPanel();
    wxString text;
    if (obstacle)
        text = wxString::Format(_("These settings cannot be changed: %s."), obstacle->Text());
    else
        text = Explain(ControlId::HighQuality, FindMissingFor("pptx")) +
               Explain(ControlId::OutputPDF, FindMissingPdfMaker());
    if (!text.empty())
        m_obstacle->Say(text.Trim(), m_area->GetMinWidth());
    FindWindow(ButtonId::Restore)->Enable(!obstacle);
}

/// @param missing what a control needs
/// @return a sentence and a space; nothing when the control can be used
wxString SettingsDialogue::Explain(int id, const std::optional<Fault>& missing) const {
    const auto* const control = dynamic_cast<const wxControl*>(m_area->FindWindow(id));
    return control && !control->IsEnabled() && missing
               ? wxString::Format(_("\"%s\" cannot be chosen: %s."), control->GetLabelText(),
                                  missing->Text()) +
                     ' '
               : wxString();
}

wxSizer* SettingsDialogue::NewButtons() {
    // Identifiers of our own: the toolkit words buttons with its own in the desktop's language.
    auto* const restore = new wxButton(this, ButtonId::Restore, _("&Restore defaults"));
    auto* const save = new wxButton(this, ButtonId::Save, _("&Save"));
    auto* const cancel = new wxButton(this, ButtonId::Cancel, _("&Cancel"));
    auto* const ends = new wxStdDialogButtonSizer;
    ends->SetAffirmativeButton(save);
    ends->SetCancelButton(cancel);
    ends->Realize();
    save->SetDefault();
    SetEscapeId(ButtonId::Cancel);
    auto* const buttons = new wxBoxSizer(wxHORIZONTAL);
    buttons->Add(restore, 0, wxALIGN_CENTER_VERTICAL);
    buttons->AddStretchSpacer();
    buttons->Add(ends);
    return buttons;
}

/// Has the window grow for the fault that it says, as far as the screen goes, and shrink after it.
void SettingsDialogue::FitToFault() {
    const wxRect screen = wxDisplay(this).GetClientArea();
    const int height = m_fault->IsShown() ? m_fault->GetBestSize().y : 0;
    wxRect place = GetRect();
    const int before = place.height;
    place.height = std::min(before + height - m_faultHeight, screen.height);
    m_faultHeight += place.height - before;
    place.y = std::max(screen.y, std::min(place.y, screen.GetBottom() + 1 - place.height));
    SetSize(place);
    Layout();
}

void SettingsDialogue::OnSave(wxCommandEvent& /*event*/) {
    SettingsValues values;
    for (const auto& filter : m_filters.Filters())
        values.merge(filter->PanelValues());
    for (const PanelChoices& choices : m_choices)
        choices.Correct(values);
    const std::optional<Fault> fault = StoreSettings(m_file, values);
    if (!fault)
        return EndModal(wxID_SAVE);
    m_fault->Say(wxString::Format(_("The settings are not saved. %s cannot be written: %s."),
                                  Shown(m_file), fault->Text()),
                 GetClientSize().x);
    FitToFault();
}

void SettingsDialogue::OnRestore(wxCommandEvent& /*event*/) {
    Settings defaults;
    FillIn(defaults);
    TranslateChoices(defaults);
    ShowPanels(defaults);
}

void SettingsDialogue::OnUnderstood(wxCommandEvent& /*event*/) {
    m_fault->Hide();
    FitToFault();
}

/// Return saves from wherever one is, but on a button, which it presses.
void SettingsDialogue::OnKey(wxKeyEvent& event) {
    const bool isReturn =
        event.GetKeyCode() == WXK_RETURN || event.GetKeyCode() == WXK_NUMPAD_ENTER;
    if (!isReturn || event.HasAnyModifiers() || dynamic_cast<const wxButton*>(FindFocus()))
        return event.Skip();
    wxCommandEvent save(wxEVT_BUTTON, ButtonId::Save);
    OnSave(save);
}

void SettingsDialogue::OnSize(wxSizeEvent& event) {
    event.Skip(); // the toolkit then lays the window out
    for (MessageBar* const bar : {m_obstacle, m_fault})
        bar->WrapTo(GetClientSize().x);
}
