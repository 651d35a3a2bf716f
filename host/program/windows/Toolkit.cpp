#include "host/program/system/Toolkit.h"

#include <windows.h>

#include <wx/choice.h>
#include <wx/event.h>
#include <wx/toplevel.h>

class FocusWatch::Connection {
public:
    Connection(wxTopLevelWindow& window, OnFocus onFocus)
        : m_window(window), m_onFocus(std::move(onFocus)) {
        m_window.Bind(wxEVT_CHILD_FOCUS, &Connection::OnChildFocus, this);
    }
    ~Connection() { m_window.Unbind(wxEVT_CHILD_FOCUS, &Connection::OnChildFocus, this); }
    Connection(const Connection&) = delete;
    Connection& operator=(const Connection&) = delete;

private:
    void OnChildFocus(wxChildFocusEvent& event) {
        event.Skip();
        m_onFocus(*event.GetWindow());
    }

    wxTopLevelWindow& m_window;
    OnFocus m_onFocus;
};

FocusWatch::FocusWatch(wxTopLevelWindow& window, OnFocus onFocus)
    : m_connection(std::make_unique<Connection>(window, std::move(onFocus))) {}

FocusWatch::~FocusWatch() = default;

bool ShowsEntries(const wxChoice& choice) {
    return SendMessageW(choice.GetHandle(), CB_GETDROPPEDSTATE, 0, 0) != 0;
}
