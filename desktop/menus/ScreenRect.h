// Rectangles in which the coordinates of panes would be too small.
#pragma once
#include "host/Geometry.h"
#include <algorithm>

struct ScreenPoint {
    int h = 0, v = 0;
};

// Logical pixels of the screen, or of anything else; right and bottom edges are outside of it.
struct ScreenRect {
    int left = 0, top = 0, right = 0, bottom = 0;

    int Width() const { return right - left; }
    int Height() const { return bottom - top; }
    bool Contains(ScreenPoint p) const { return p.h >= left && p.h < right && p.v >= top && p.v < bottom; }
    ScreenRect Moved(int dh, int dv) const { return {left + dh, top + dv, right + dh, bottom + dv}; }
    ScreenRect Inset(int by) const { return {left + by, top + by, right - by, bottom - by}; }
    // Moved into the other, as far as it fits; its top left corner counts before the other corners.
    ScreenRect Within(ScreenRect const &other) const {
        return Moved(std::max(other.left, std::min(left, other.right - Width())) - left,
                     std::max(other.top, std::min(top, other.bottom - Height())) - top);
    }

    static ScreenRect Of(Rect const &r) { return {r.left, r.top, r.right, r.bottom}; }
};
