// One axis of rectangles and points, so that upright and level panes share their code.
#pragma once
#include "host/Geometry.h"

class SingleAxis {
public:
    // The vertical axis or the horizontal one.
    explicit SingleAxis(bool isVertical)
        : vertical(isVertical) {}

    SingleAxis Across() const { return SingleAxis(!vertical); } // the other axis
    bool IsVertical() const { return vertical; }                // which one this is

    short Place(Point const &p) const { return vertical ? p.v : p.h; }       // a point's coordinate
    short Start(Rect const &r) const { return vertical ? r.top : r.left; }   // a rectangle's top or left
    short End(Rect const &r) const { return vertical ? r.bottom : r.right; } // its bottom or right
    // Its height or width, as a signed 16-bit number.
    short Length(Rect const &r) const { return static_cast<short>(End(r) - Start(r)); }

    short &Place(Point &p) const { return vertical ? p.v : p.h; }       // the same coordinates, to be changed
    short &Start(Rect &r) const { return vertical ? r.top : r.left; }   // the same
    short &End(Rect &r) const { return vertical ? r.bottom : r.right; } // the same

private:
    bool vertical;
};
