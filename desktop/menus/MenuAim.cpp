#include "desktop/menus/MenuAim.h"
#include <cstdlib>

namespace {

int const kCornerSlack = 12; // pixels above and below the submenu that still count as aiming at it

// Twice the area of the triangle, positive when it runs clockwise on the screen.
long long Turn(ScreenPoint a, ScreenPoint b, ScreenPoint c) {
    return static_cast<long long>(b.h - a.h) * (c.v - a.v) - static_cast<long long>(b.v - a.v) * (c.h - a.h);
}

bool InTriangle(ScreenPoint p, ScreenPoint a, ScreenPoint b, ScreenPoint c) {
    long long const ab = Turn(a, b, p), bc = Turn(b, c, p), ca = Turn(c, a, p);
    return (ab >= 0 && bc >= 0 && ca >= 0) || (ab <= 0 && bc <= 0 && ca <= 0);
}

} // namespace

bool MenuAim::Follow(ScreenPoint p, ScreenRect const &submenu) {
    bool aiming = false;
    if (!trail.empty()) {
        ScreenPoint const from = trail.front();
        bool const fromLeft = from.h < submenu.left;
        int const edge = fromLeft ? submenu.left : submenu.right - 1;
        aiming =
            std::abs(edge - p.h) < std::abs(edge - from.h) &&
            InTriangle(p, from, {edge, submenu.top - kCornerSlack}, {edge, submenu.bottom + kCornerSlack});
    }
    trail.push_back(p);
    if (trail.size() > kTrail)
        trail.pop_front();
    return aiming;
}
