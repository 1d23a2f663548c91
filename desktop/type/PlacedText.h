// Puts shaped text on the current port.
#pragma once
#include "desktop/type/ShapedText.h"
#include "host/Geometry.h"
#include "host/TextSettings.h"

namespace PlacedText {

// A horizontal scale that makes sense: what is not a number above 0 is 1.
float CleanScale(float);
// The width under a horizontal scale, rounded up.
int Scaled(int width, float scale);
// The width that becomes `width` under the scale, rounded down.
int Unscaled(int width, float scale);

// How a text stands in its rectangle.
struct Placement {
    TextSettings::Alignment alignment = TextSettings::kAlignDefault;
    int verticalAlignment = 0; // 0 top, 1 centre
    bool wraps = false;        // lines below the rectangle are cut
    float scale = 1;           // clean
};

// Draws the text in the rectangle, in the port's foreground colour. What is wider than the rectangle is cut
// at its sides.
void Draw(ShapedText const &, Rect const &, Placement const &);
// Draws a line with its baseline starting at the point, cut after `maxWidth` pixels; TextShape::kUnlimited is
// no limit.
void DrawLine(ShapedText const &, Point baseline, int maxWidth);
// Whether a line of any length with its baseline there could show.
bool LineCouldShow(FontSpec const &, Point baseline);
// Whether text in the rectangle could show.
bool CouldShow(FontSpec const &, Rect const &);

} // namespace PlacedText
