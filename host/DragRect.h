// Dragging the outline of a rectangle.
#pragma once
#include "host/Geometry.h"

class GlogPane;

// Takes part in a drag: scrolls, say, while the mouse is near an edge.
class DragRegionUpdater {
public:
    virtual ~DragRegionUpdater() {}
    // Called in each pass of the drag, also while the mouse rests. The outline is off the screen meanwhile.
    virtual void UpdateDragRegion() = 0;
};

namespace DragRegionTypes {

// The directions in which the outline can be moved.
enum Constraint { kFree = 0, kHorizontalOnly = 1, kVerticalOnly = 2 };

// How a drag has ended: whether the outline was moved from its place, and by how many pixels, right and down
// when positive. Without a move the offsets are 0.
struct Result {
    bool moved;
    double dh, dv;
};

} // namespace DragRegionTypes

// Drags the rectangle's outline with the mouse, from the start point, until the button is released.
// Everything is in the pane's coordinates. The outline stays within the limit; released outside of the slop,
// it counts as not moved. The updater may be null and stays the caller's.
DragRegionTypes::Result DragRect(GlogPane *, OS::RectBase<OS::RectTag> const &rect, OS::Point const &start,
                                 OS::RectBase<OS::RectTag> const &limit,
                                 OS::RectBase<OS::RectTag> const &slop, DragRegionTypes::Constraint,
                                 DragRegionUpdater *);
