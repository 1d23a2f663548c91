// The look of a progress bar, for whoever shows one without a pane of its own.
#pragma once
#include "host/Geometry.h"

// Draws a bar across the rectangle on the current port, as high as its icons and centred from top to bottom;
// its end caps want an even number of pixels between them, so that a bar may be a pixel narrower than the
// rectangle. The fraction, 0.0 to 1.0, is how much of the width is filled; it does not count for a bar that
// is not active. The port's state is left as it was.
void DrawProgressBarInRect(OS::RectBase<OS::RectTag> const &, double fraction, bool active);
// Whether active bars of the two fractions look the same in the rectangle, pixel for pixel.
bool ProgressLooksAlike(OS::RectBase<OS::RectTag> const &, double fraction, double otherFraction);
