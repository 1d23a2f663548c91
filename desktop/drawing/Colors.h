// Between the two kinds of colour.
#pragma once
#include "host/RGBColor.h"

// Opaque; each component is divided by 65535 in single precision, as all panes do it, so that the same colour
// always gives the same four numbers.
OS::RGBAColor ToRGBA(RGBColor const &);

// The nearest colour, without the alpha; components beyond 0 to 1 are cut, what is not a number counts as 0.
// Undoes ToRGBA exactly.
RGBColor ToRGB(OS::RGBAColor const &);

// A gray of the given percent of white; percentages beyond 0 to 100 are cut.
RGBColor GrayOf(int percent);
