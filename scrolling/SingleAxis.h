// One axis of rectangles and points, so that upright and level panes share their code.
#pragma once
#include "host/Geometry.h"

class SingleAxis {
public:
    explicit SingleAxis(bool vertical_)
        : vertical(vertical_) {}

    SingleAxis Across() const { return SingleAxis(!vertical); }
    bool IsVertical() const { return vertical; }

    short Place(Point const &p) const { return vertical ? p.v : p.h; }
    short Start(Rect const &r) const { return vertical ? r.top : r.left; }
    short End(Rect const &r) const { return vertical ? r.bottom : r.right; }
    // As a signed 16-bit number.
    short Length(Rect const &r) const { return static_cast<short>(End(r) - Start(r)); }

    short &Place(Point &p) const { return vertical ? p.v : p.h; }
    short &Start(Rect &r) const { return vertical ? r.top : r.left; }
    short &End(Rect &r) const { return vertical ? r.bottom : r.right; }

private:
    bool vertical;
};
