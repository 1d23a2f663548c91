#pragma once
#include "host/Geometry.h"
class GlogPane;

class DragRegionUpdater {
public:
    virtual ~DragRegionUpdater() {}
    virtual void UpdateDragRegion() = 0;
};

namespace DragRegionTypes {

enum Constraint { kFree = 0, kHorizontalOnly = 1, kVerticalOnly = 2 };

struct Result {
    bool moved;
    double dh, dv;
};
}

DragRegionTypes::Result DragRect(GlogPane *, OS::RectBase<OS::RectTag> const &rect, OS::Point const &start,
                                 OS::RectBase<OS::RectTag> const &limit, OS::RectBase<OS::RectTag> const &slop,
                                 DragRegionTypes::Constraint, DragRegionUpdater *);
