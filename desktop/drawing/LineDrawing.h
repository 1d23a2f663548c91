// Lines of whole pixels.
#pragma once
#include "host/Geometry.h"
#include "host/RGBColor.h"
#include "host/VelaDrawing.h"

class PixelScope;

// Draws from one point to the other, both included, with a pen that hangs below and to the right of the
// points; local coordinates. The pixels are the same in both directions, and every pixel is drawn once, so
// that transparent colours come out even. A pen without width or height draws nothing.
void DrawLine(PixelScope &, PenState const &, Point to, OS::RGBAColor const &);
