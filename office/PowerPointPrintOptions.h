#pragma once

#include "office/dispatch/PowerPointObjects.h"
#include "plugin/settings/PowerPointOptions.h"

// The user's options in PowerPoint's numbers. The texts among them are the settings panel's, in
// whatever language it had; a text that is none of the panel's leaves PowerPoint's own choice.

/// Colour, grayscale or black and white.
void PutColour(powerpoint::PrintOptions& target, const PowerPointOptions& options);

/// What is printed (slides, handouts with so many slides, notes pages, outline), and the order of
/// the slides on handouts.
void PutContents(powerpoint::PrintOptions& target, const PowerPointOptions& options);

/// The four yes-or-no options.
void PutSwitches(powerpoint::PrintOptions& target, const PowerPointOptions& options);
