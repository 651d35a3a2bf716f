#pragma once

#include <wx/panel.h>

/// A line of one pixel beside a heading. It stands in the middle of the cell that its sizer gives
/// it and runs on to the right edge of its parent, wherever its cell ends.
class SeparatorLine : public wxPanel {
public:
    SeparatorLine(wxWindow* parent, int id);

protected:
    void DoSetSize(int x, int y, int width, int height, int flags) override;
};
