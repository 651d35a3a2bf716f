#pragma once

#include <wx/panel.h>
#include <wx/stattext.h>

/// A text across a window, in as many lines as it takes. Hidden until it has something to say.
class MessageBar : public wxPanel {
public:
    explicit MessageBar(wxWindow* parent);

    /// Adds a button behind the text.
    void AddButton(int id, const wxString& label);

    /// Shows a text, wrapped for a window of this width; the window then has to lay itself out.
    void Say(const wxString& text, int width);

    /// Wraps the text anew, for a window that has another width now.
    void WrapTo(int width);

private:
    wxString m_message;
    wxStaticText* m_text;
};
