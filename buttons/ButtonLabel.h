// How the labels of push buttons are laid out: one upright line, centred both ways, in the colour of the
// mode.
#pragma once
#include "host/Geometry.h"
#include "host/TextLayout.h"
#include "host/UString.h"

namespace ButtonLabel {

// Makes the layout ready for the text in a font of the application's font table.
void Update(OS::TextLayout &, UString const &, int font);
// Sets the foreground colour for a button in that mode: inactive for GlogButtonPane::kDisabled alone, every
// other mode counts as active. The caller saves the colours.
void SetColor(unsigned char mode);
// Draws the text in the middle of the rectangle, in the foreground colour.
void Draw(OS::TextLayout &, UString const &, Rect const &, int font);

} // namespace ButtonLabel
