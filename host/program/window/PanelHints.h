#pragma once

class wxWindow;

/// Has the controls of a filter's panel explain themselves under the mouse, where their labels are
/// too short for it: what they do, and what for when they are greyed out.
void ExplainControls(wxWindow& panel);
