// The direction of a line on the screen.
#pragma once
#include "host/Geometry.h"

// From the rectangle's centre to the point and back alike: degrees from 0 to 179, clockwise, 0 upward, in the
// rectangle's proportions.
short AngleOfLine(Rect const &, Point);
