#include "desktop/drawing/TouchedBoxes.h"
#include <cstdint>
#include <utility>

namespace {

constexpr std::size_t kMostBoxes = 16;
// How many pixels two boxes may take in needlessly when they are made one.
constexpr std::int64_t kTolerableWaste = 4096;

std::int64_t Area(DeviceRect const &r) { return static_cast<std::int64_t>(r.Width()) * r.Height(); }

std::int64_t Waste(DeviceRect const &a, DeviceRect const &b) { return Area(a.United(b)) - Area(a) - Area(b); }

} // namespace

void TouchedBoxes::AddUncovered(DeviceRect const &box) {
    if (box.Empty())
        return;
    std::size_t best = boxes.size();
    std::int64_t least = 0;
    for (std::size_t i = 0; i < boxes.size(); ++i) {
        std::int64_t waste = Waste(boxes[i], box);
        if (best == boxes.size() || waste < least) {
            best = i;
            least = waste;
        }
    }
    if (best < boxes.size() && (least <= kTolerableWaste || boxes.size() == kMostBoxes)) {
        boxes[best] = boxes[best].United(box);
        latest = best;
    } else {
        boxes.push_back(box);
        latest = boxes.size() - 1;
    }
}

std::vector<DeviceRect> TouchedBoxes::Take() {
    latest = 0;
    return std::exchange(boxes, {});
}
