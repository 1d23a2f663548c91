#include "desktop/drawing/WholePixels.h"
#include <algorithm>
#include <cmath>
#include <limits>

namespace {

constexpr int kLeastPixel = std::numeric_limits<short>::min();
constexpr int kGreatestPixel = std::numeric_limits<short>::max();
// Beyond any window, and small enough to be drawn at every scale.
constexpr double kFarthest = 4.0 * kGreatestPixel;

} // namespace

short SaturatedPixel(int value) { return static_cast<short>(std::clamp(value, kLeastPixel, kGreatestPixel)); }

short WholePixel(double value) {
    if (std::isnan(value))
        return 0;
    double rounded = std::floor(value + 0.5);
    return static_cast<short>(
        std::clamp(rounded, static_cast<double>(kLeastPixel), static_cast<double>(kGreatestPixel)));
}

double FiniteCoordinate(double value) {
    return std::isnan(value) ? 0.0 : std::clamp(value, -kFarthest, kFarthest);
}

Rect WholeRect(OS::RectBase<OS::RectTag> const &r) {
    short left = WholePixel(r.origin.x), right = WholePixel(r.origin.x + r.size.width);
    short top = WholePixel(r.origin.y), bottom = WholePixel(r.origin.y + r.size.height);
    return {std::min(top, bottom), std::min(left, right), std::max(top, bottom), std::max(left, right)};
}
