#include "host/program/system/Toolkit.h"

#include <wx/choice.h>
#include <wx/toplevel.h>

#include <glib-object.h>

namespace {

/// @return the window, or the one below it, that wraps the control; null when there is none
wxWindow* FindByControl(wxWindow& window, gpointer control) {
    if (window.GetHandle() == control)
        return &window;
    for (wxWindow* const child : window.GetChildren())
        if (wxWindow* const found = FindByControl(*child, control))
            return found;
    return nullptr;
}

gpointer ParentOf(gpointer control) {
    gpointer parent = nullptr;
    g_object_get(control, "parent", &parent, nullptr);
    if (parent)
        g_object_unref(parent); // the control has it, too
    return parent;
}

} // namespace

/// The focus of a choice is a button's within, and wxWidgets does not hear of it: it is GTK's
/// window that tells.
class FocusWatch::Connection {
public:
    Connection(wxTopLevelWindow& window, OnFocus onFocus)
        : m_window(window), m_onFocus(std::move(onFocus)) {
        const auto onSetFocus = +[](gpointer, gpointer control, Connection* self) {
            wxWindow* found = nullptr;
            for (gpointer each = control; each && !found; each = ParentOf(each))
                found = FindByControl(self->m_window, each);
            if (found)
                self->m_onFocus(*found);
        };
        g_signal_connect(m_window.GetHandle(), "set-focus", G_CALLBACK(onSetFocus), this);
    }
    ~Connection() { g_signal_handlers_disconnect_by_data(m_window.GetHandle(), this); }
    Connection(const Connection&) = delete;
    Connection& operator=(const Connection&) = delete;

private:
    wxTopLevelWindow& m_window;
    OnFocus m_onFocus;
};

FocusWatch::FocusWatch(wxTopLevelWindow& window, OnFocus onFocus)
    : m_connection(std::make_unique<Connection>(window, std::move(onFocus))) {}

FocusWatch::~FocusWatch() = default;

bool ShowsEntries(const wxChoice& /*choice*/) {
    return false; // they are in a window of their own, which takes all for itself
}
