// From floating coordinates to whole logical pixels.
#pragma once
#include "host/Geometry.h"

// Brings any number into 16 bits; the ends stand for everything beyond them.
short SaturatedPixel(int);

// The nearest whole pixel, halves up. Numbers beyond 16 bits give the end that they lie beyond, what is not a
// number gives 0.
short WholePixel(double);

// A coordinate as it may go to a curve: what is not a number becomes 0, and what lies far outside of any
// window is brought nearer.
double FiniteCoordinate(double);

// The rectangle with each edge at its nearest whole pixel; one of negative width or height has its edges
// exchanged.
Rect WholeRect(OS::RectBase<OS::RectTag> const &);
