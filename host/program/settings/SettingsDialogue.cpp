#include "host/program/settings/SettingsDialogue.h"

#include "common/Themer.h"
#include "host/program/PathText.h"
#include "host/program/settings/Settings.h"

#include <wx/button.h>
#include <wx/display.h>
#include <wx/intl.h>
#include <wx/scrolwin.h>
#include <wx/settings.h>
#include <wx/sizer.h>
#include <wx/statline.h>

namespace {

constexpr int ScrollStep = 10; // all sizes in device-independent pixels
constexpr int Margin = 10;
constexpr int ScreenMargin = 80; // room for the window's frame and the desktop's bars

/// Scrolls; only what is in it has a use for keys.
class ScrolledArea : public wxScrolledWindow {
public:
    explicit ScrolledArea(wxWindow* parent)
        : wxScrolledWindow(parent, wxID_ANY, wxDefaultPosition, wxDefaultSize,
                           wxTAB_TRAVERSAL | wxBORDER_NONE) {
        m_container.DisableSelfFocus();
    }
};

} // namespace

SettingsDialogue::SettingsDialogue(const FilterSet& filters, const Settings& settings,
                                   const std::filesystem::path& file)
    : wxDialog(nullptr, wxID_ANY, _("Print Settings"), wxDefaultPosition, wxDefaultSize,
               wxDEFAULT_DIALOG_STYLE | wxRESIZE_BORDER),
      m_filters(filters), m_file(file) {
    m_fault = new wxInfoBar(this);
    m_fault->AddButton(ButtonId::Understood, _("OK"));
    auto* const top = new wxBoxSizer(wxVERTICAL);
    top->Add(NewPanels(settings), 1, wxEXPAND);
    top->Add(m_fault, 0, wxEXPAND);
    top->Add(new wxStaticLine(this), 0, wxEXPAND);
    top->Add(NewButtons(), 0, wxEXPAND | wxALL, FromDIP(Margin));
    SetSizerAndFit(top);
    Bind(wxEVT_BUTTON, &SettingsDialogue::OnSave, this, ButtonId::Save);
    Bind(wxEVT_CHAR_HOOK, &SettingsDialogue::OnKey, this);
    CentreOnScreen();
}

/// As large as the panels together, or as the screen allows.
wxScrolledWindow* SettingsDialogue::NewPanels(const Settings& settings) {
    auto* const area = new ScrolledArea(this);
    area->SetBackgroundColour(Themer::GetThemeService()->GetTheme("Default").backgroundColour);
    auto* const panels = new wxBoxSizer(wxVERTICAL);
    for (const auto& filter : m_filters.Filters())
        if (wxWindow* const panel = filter->CreatePanel(area, settings.Node())) {
            panels->Add(panel, 0, wxEXPAND);
            m_hasPanel = true;
        }
    area->SetSizer(panels);
    const int step = FromDIP(ScrollStep);
    area->SetScrollRate(step, step);
    const wxSize wanted = panels->ComputeFittingClientSize(area);
    const wxSize screen = wxDisplay(this).GetClientArea().GetSize();
    const int margin = FromDIP(ScreenMargin);
    wxSize size = wanted;
    size.DecTo(screen - wxSize(margin, 2 * margin));
    if (size.y < wanted.y) // a scroll bar takes its width from the panels
        size.x += wxSystemSettings::GetMetric(wxSYS_VSCROLL_X, this);
    area->SetMinSize(size);
    return area;
}

wxSizer* SettingsDialogue::NewButtons() {
    // Identifiers of our own: the toolkit words buttons with its own in the desktop's language.
    auto* const save = new wxButton(this, ButtonId::Save, _("&Save"));
    auto* const cancel = new wxButton(this, ButtonId::Cancel, _("&Cancel"));
    auto* const buttons = new wxStdDialogButtonSizer;
    buttons->SetAffirmativeButton(save);
    buttons->SetCancelButton(cancel);
    buttons->Realize();
    save->SetDefault();
    SetEscapeId(ButtonId::Cancel);
    return buttons;
}

void SettingsDialogue::OnSave(wxCommandEvent& /*event*/) {
    SettingsValues values;
    for (const auto& filter : m_filters.Filters())
        values.merge(filter->PanelValues());
    const wxString fault = StoreSettings(m_file, values);
    if (fault.empty())
        return EndModal(wxID_SAVE);
    m_fault->ShowMessage(
        wxString::Format(_("The settings are not saved. %s cannot be written: %s."), Shown(m_file),
                         fault),
        wxICON_ERROR);
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
