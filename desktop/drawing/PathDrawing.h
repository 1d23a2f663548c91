// Shapes as Cairo paths.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "desktop/observe/JsonLine.h"

class OSPath;
typedef struct _cairo cairo_t; // NOLINT(bugprone-reserved-identifier): Cairo's own name

namespace PathDrawing {

// Appends the path in user space.
void Append(cairo_t *, OSPath const &);
// Appends the rectangle with corners rounded by quarters of an ellipse of the given radii, which are cut to
// half of the rectangle. User space must be device pixels.
void AppendRoundRect(cairo_t *, DeviceRect const &, double radiusH, double radiusV);
// Appends the ellipse that fills the rectangle, in user space.
void AppendOval(cairo_t *, double left, double top, double width, double height);

// A rectangle around the path, `margin` away from its points.
Rect Bounds(OSPath const &, double margin);

// The call with its path, for the trace: the points of each subpath as [h,v], and "close" where one is
// closed.
JsonLine Described(char const *operation, OSPath const &);

} // namespace PathDrawing
