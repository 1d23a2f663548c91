// Which device pixels have been drawn on.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <vector>

// Collects boxes, merging those that overlap or adjoin closely, so that adding costs next to nothing and
// never more than a few boxes result. The boxes cover all that was added, at times a little more.
class TouchedBoxes {
public:
    void Add(DeviceRect const &box) {
        if (!boxes.empty() && boxes[latest].Contains(box))
            return;
        AddUncovered(box);
    }
    bool Empty() const { return boxes.empty(); }
    // Gives the boxes away and starts afresh.
    std::vector<DeviceRect> Take();

private:
    void AddUncovered(DeviceRect const &);
    std::vector<DeviceRect> boxes;
    std::size_t latest = 0; // the box that grew last: drawing mostly stays in one place for a while
};
