#include "host/program/window/ScrolledArea.h"

#include "host/program/system/Toolkit.h"

#include <wx/choice.h>

#include <algorithm>

namespace {

constexpr int ScrollStep = 10; // in device-independent pixels

/// One direction of scrolling, in pixels.
struct Direction {
    int step;
    int start; ///< how far it has been scrolled, in steps
    int room;

    /// The start, in steps, with which the stretch from one place to another is to be seen, and a
    /// step before and behind it.
    int StartFor(int from, int to) const {
        if (from < step)
            return std::max(0, start + (from - step - (step - 1)) / step);
        if (to > room - step)
            return start + (to - room + step + (step - 1)) / step;
        return start;
    }
};

void ForEachChoiceIn(wxWindow* window, const std::function<void(wxChoice&)>& visit) {
    for (wxWindow* const child : window->GetChildren()) {
        if (auto* const choice = dynamic_cast<wxChoice*>(child))
            visit(*choice);
        ForEachChoiceIn(child, visit);
    }
}

} // namespace

ScrolledArea::ScrolledArea(wxWindow* parent)
    : wxScrolledWindow(parent, wxID_ANY, wxDefaultPosition, wxDefaultSize,
                       wxTAB_TRAVERSAL | wxBORDER_NONE) {
    m_container.DisableSelfFocus();
    const int step = FromDIP(ScrollStep);
    SetScrollRate(step, step);
}

// wxWidgets scrolls by itself to controls that are its children, but not to those of panels in it.
void ScrolledArea::BringIntoView(wxWindow& control) {
    if (!IsDescendant(&control))
        return;
    const wxRect place(ScreenToClient(control.GetScreenPosition()), control.GetSize());
    const wxSize room = GetClientSize();
    Direction across{0, 0, room.x};
    Direction down{0, 0, room.y};
    GetScrollPixelsPerUnit(&across.step, &down.step);
    GetViewStart(&across.start, &down.start);
    Scroll(across.StartFor(place.GetLeft(), place.GetRight()),
           down.StartFor(place.GetTop(), place.GetBottom()));
}

void ScrolledArea::TakeWheelFromChoices() {
    ForEachChoiceIn(this, [this](wxChoice& choice) {
        choice.Bind(wxEVT_MOUSEWHEEL, [this, &choice](wxMouseEvent& event) {
            if (ShowsEntries(choice))
                event.Skip();
            else
                HandleOnMouseWheel(event);
        });
    });
}
