// Set operations on regions, for the desktop's own use.
#pragma once
#include "host/Geometry.h"
#include "host/OSRgn.h"
#include <vector>

struct pixman_region32;

// What stands behind an OSRgn. All coordinates are logical pixels.
namespace Region {

pixman_region32 *Raw(OSRgn &);
pixman_region32 const *Raw(OSRgn const &);

bool IsEmpty(OSRgn const &);
Rect Bounds(OSRgn const &);             // all zero when empty
std::vector<Rect> Rects(OSRgn const &); // from top to bottom, then left to right
long long Area(OSRgn const &);

void Clear(OSRgn &);
void SetRect(OSRgn &, Rect const &); // an empty or inverted rectangle gives the empty region
void UniteRect(OSRgn &, Rect const &);
void Unite(OSRgn &, OSRgn const &);
void IntersectRect(OSRgn &, Rect const &);
void Intersect(OSRgn &, OSRgn const &);
void Subtract(OSRgn &, OSRgn const &);
void Translate(OSRgn &, int dh, int dv);
bool Touches(OSRgn const &, Rect const &); // false for an empty rectangle
bool Equal(OSRgn const &, OSRgn const &);
bool Is(OSRgn const &, Rect const &); // this rectangle and no more; false for an empty one

} // namespace Region
