#include "host/Coordinate.h"
#include "desktop/panes/PaneAccess.h"

OS::Point Coordinate::PaneToWindow(GlogPane &pane, OS::Point const &p) {
    Point const origin = PaneAccess::Origin(pane);
    return OS::Point(p.x + origin.h, p.y + origin.v);
}

OS::RectBase<OS::RectTag> Coordinate::PaneToWindow(GlogPane &pane, OS::RectBase<OS::RectTag> const &r) {
    OS::RectBase<OS::RectTag> moved = r;
    moved.origin = PaneToWindow(pane, r.origin);
    return moved;
}
