// Dragging the outline of a rectangle.
#pragma once
#include "host/Geometry.h"

class GlogPane;

// Takes part in a drag: scrolls, say, while the mouse is near an edge.
class DragRegionUpdater {
public:
    virtual ~DragRegionUpdater() {}
    // Called in each pass of the drag, also, every MouseTask::DefaultAutoScrollTime, while the mouse rests.
    // What it draws comes up under the outline. It may delete the pane or close its window, which ends the
    // drag.
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

// Drags the rectangle's outline with the mouse, from the start point, until the button is released; the pane
// is prepared then. Everything is in the pane's coordinates. The limit holds the point by which the outline
// was taken, and cuts what shows of the outline. With the mouse outside of the slop the outline is back at
// its place; released there, it counts as not moved. The updater may be null and stays the caller's.
// Fractions of pixels are rounded.
DragRegionTypes::Result DragRect(GlogPane *, OS::RectBase<OS::RectTag> const &rect, OS::Point const &start,
                                 OS::RectBase<OS::RectTag> const &limit,
                                 OS::RectBase<OS::RectTag> const &slop, DragRegionTypes::Constraint,
                                 DragRegionUpdater *);
