// Thin lines that divide one part of a window from another, in the colour kPanelUnderline.
#pragma once
#include "host/Geometry.h"

// Draws the line between the points on the current port: level and a pixel lower than they are, from the left
// one to the right one, or, when both have the same h, upright and a pixel to the right of them. The pen ends
// up where the line does; the port's colours stay.
void DrawGLine(Point, Point);
// The same from the pen to the point.
void SimpleGLineTo(short h, short v);
