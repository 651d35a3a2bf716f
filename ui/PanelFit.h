#pragma once

class wxWindow;

/// Fits a finished panel to its texts, which differ with language and font: gives its choices room
/// for their entries and puts the controls of its rows into one column. Sizes only grow.
void FitToTexts(wxWindow* panel);
