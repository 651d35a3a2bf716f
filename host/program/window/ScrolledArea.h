#pragma once

#include <wx/scrolwin.h>

/// Scrolls what is larger than it. Only what is in it has a use for keys.
class ScrolledArea : public wxScrolledWindow {
public:
    explicit ScrolledArea(wxWindow* parent);

    /// Scrolls until a control in it is to be seen, if it is not.
    void BringIntoView(wxWindow& control);

    /// Has the mouse wheel scroll over the choices in it, too, instead of changing them.
    void TakeWheelFromChoices();
};
