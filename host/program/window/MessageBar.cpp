#include "host/program/window/MessageBar.h"

#include "common/Themer.h"

#include <wx/button.h>
#include <wx/sizer.h>

namespace {

constexpr int Margin = 10; // in device-independent pixels

/// Whether a line may end behind a letter: paths have no spaces, and Japanese has none at all.
bool MayEndBehind(wxUniChar letter, wxUniChar next) {
    constexpr unsigned FirstIdeographic = 0x2E80;
    const wxString beforeNoLine = wxString::FromUTF8("。、」』）？！・ーっゃゅょッャュョ");
    if (next == ' ' || beforeNoLine.Contains(next))
        return false;
    return wxString(" /\\_").Contains(letter) || letter.GetValue() >= FirstIdeographic ||
           next.GetValue() >= FirstIdeographic;
}

/// The text in lines that are no wider than this in the window; a word that is goes on in the next
/// line.
wxString Wrapped(const wxWindow& window, const wxString& text, int width) {
    wxString lines;
    wxString line;
    std::size_t end = 0; // of the line, if it has to end
    for (std::size_t i = 0; i < text.length(); ++i) {
        if (!line.empty() && window.GetTextExtent((line + text[i]).Trim()).x > width) {
            const std::size_t length = end > 0 ? end : line.length();
            lines << line.Left(length).Trim() << '\n';
            line.erase(0, length);
            end = 0;
        }
        line += text[i];
        if (i + 1 < text.length() && MayEndBehind(text[i], text[i + 1]))
            end = line.length();
    }
    return lines + line;
}

} // namespace

MessageBar::MessageBar(wxWindow* parent)
    : wxPanel(parent), m_text(new wxStaticText(this, wxID_ANY, wxEmptyString)) {
    const Theme& theme = Themer::GetThemeService()->GetTheme("Note");
    SetBackgroundColour(theme.backgroundColour);
    m_text->SetForegroundColour(theme.textColour);
    auto* const row = new wxBoxSizer(wxHORIZONTAL);
    row->Add(m_text, 1, wxALIGN_CENTER_VERTICAL | wxALL, FromDIP(Margin));
    SetSizer(row);
    m_container.DisableSelfFocus();
    Hide();
}

void MessageBar::AddButton(int id, const wxString& label) {
    GetSizer()->Add(new wxButton(this, id, label), 0,
                    wxALIGN_CENTER_VERTICAL | wxTOP | wxRIGHT | wxBOTTOM, FromDIP(Margin));
}

void MessageBar::Say(const wxString& text, int width) {
    m_message = text;
    Show();
    WrapTo(width);
}

void MessageBar::WrapTo(int width) {
    m_text->SetLabelText(wxEmptyString);
    const int beside = GetSizer()->CalcMin().x; // margins and a button
    m_text->SetLabelText(Wrapped(*m_text, m_message, width - beside));
    InvalidateBestSize();
}
