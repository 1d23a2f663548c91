#include "host/OSRgn.h"
#include "desktop/drawing/OSRgnRep.h"
#include "desktop/drawing/Region.h"
#include "desktop/drawing/WholePixels.h"
#include <limits>
#include <utility>

OSRgn::OSRgn() { RegionAccess::Make(*this); }

OSRgn::OSRgn(Rect const &r)
    : OSRgn() {
    Region::SetRect(*this, r);
}

OSRgn::OSRgn(OSRgn const &other) {
    pixman_region32_copy(RegionAccess::Make(*this), RegionAccess::Raw(other));
}

OSRgn::~OSRgn() { pixman_region32_fini(RegionAccess::Raw(*this)); }

OSRgn &OSRgn::operator=(OSRgn const &other) {
    if (this != &other)
        pixman_region32_copy(RegionAccess::Raw(*this), RegionAccess::Raw(other));
    return *this;
}

bool OSRgn::Contains(Point const &p) const {
    return pixman_region32_contains_point(RegionAccess::Raw(*this), p.h, p.v, nullptr) != 0;
}

void OSRgn::Offset(double dh, double dv) { Region::Translate(*this, WholePixel(dh), WholePixel(dv)); }

TempRgn::TempRgn()
    : region(new OSRgn) {}

TempRgn::~TempRgn() { delete region; }

AutoRgnHandle::~AutoRgnHandle() { delete region; }

void AutoRgnHandle::Copy(OSRgn *original) { reset(original ? new OSRgn(*original) : nullptr); }

void AutoRgnHandle::reset(OSRgn *replacement) {
    if (replacement != region)
        delete std::exchange(region, replacement);
}

Rect CarbonUtils::GetRgnBounds(OSRgn *region) {
    constexpr short kLeast = std::numeric_limits<short>::min(), kGreatest = std::numeric_limits<short>::max();
    return region ? Region::Bounds(*region) : Rect{kLeast, kLeast, kGreatest, kGreatest};
}
