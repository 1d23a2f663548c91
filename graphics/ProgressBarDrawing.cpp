#include "graphics/ProgressBarDrawing.h"
#include "graphics/WholeNumber.h"
#include "host/Icons.h"
#include "host/OSPort.h"
#include "host/PortSavers.h"
#include <cmath>

namespace {

short const kFamily = 1605;
enum FirstIcon { kEmpty = 0, kInactive = 3, kFull = 6 }; // of a left cap, a middle and a right cap
unsigned int const kSavedParts = 8;

// Where the bar goes in the rectangle.
OS::RectBase<OS::RectTag> BarIn(OS::RectBase<OS::RectTag> r) {
    Rect const icon = GetIconBounds(kFamily);
    double const height = icon.bottom, width = icon.right;
    r.origin.y += std::floor((r.size.height - height) * 0.5);
    r.size.height = height;
    if (WholeNumber(r.size.width - width * 2.0) % 2 != 0)
        r.size.width -= 1.0;
    return r;
}

// The part of the bar that is filled.
OS::RectBase<OS::RectTag> FilledPart(OS::RectBase<OS::RectTag> bar, double fraction) {
    bar.size.width *= fraction;
    return bar;
}

// Where a clip ends that ends at the place: clips are whole pixels.
double PixelEdge(double place) { return std::floor(place + 0.5); }

} // namespace

bool ProgressLooksAlike(OS::RectBase<OS::RectTag> const &rect, double fraction, double otherFraction) {
    OS::RectBase<OS::RectTag> const bar = BarIn(rect);
    auto const end = [&](double shown) {
        return PixelEdge(bar.origin.x + FilledPart(bar, shown).size.width);
    };
    return end(fraction) == end(otherFraction);
}

void DrawProgressBarInRect(OS::RectBase<OS::RectTag> const &rect, double fraction, bool active) {
    OS::RectBase<OS::RectTag> const bar = BarIn(rect);
    WithSaveGraphicsState const saved(OSPort::Current(), kSavedParts);
    OSPort::Current().NarrowClip(bar);
    if (!active) {
        TileIconInRectWithEndCaps(bar, kFamily, kInactive);
        return;
    }
    TileIconInRectWithEndCaps(bar, kFamily, kEmpty);
    // The full bar through a narrower clip: it has its caps at the outer ends only.
    OSPort::Current().NarrowClip(FilledPart(bar, fraction));
    TileIconInRectWithEndCaps(bar, kFamily, kFull);
}
