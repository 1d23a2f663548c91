#include "desktop/drawing/Region.h"
#include "desktop/drawing/OSRgnRep.h"
#include "desktop/drawing/WholePixels.h"

namespace {

bool IsEmptyRect(Rect const &r) { return r.right <= r.left || r.bottom <= r.top; }

// pixman takes sizes as unsigned and complains about rectangles without pixels: only good ones may come here.
unsigned Width(Rect const &r) { return static_cast<unsigned>(r.right - r.left); }
unsigned Height(Rect const &r) { return static_cast<unsigned>(r.bottom - r.top); }

Rect FromBox(pixman_box32_t const &box) {
    return {SaturatedPixel(box.y1), SaturatedPixel(box.x1), SaturatedPixel(box.y2), SaturatedPixel(box.x2)};
}

// pixman's queries take a region that is not const, though they do not change it.
pixman_region32_t *Queried(OSRgn const &region) {
    return const_cast<pixman_region32_t *>(RegionAccess::Raw(region));
}

} // namespace

pixman_region32 *Region::Raw(OSRgn &region) { return RegionAccess::Raw(region); }

pixman_region32 const *Region::Raw(OSRgn const &region) { return RegionAccess::Raw(region); }

bool Region::IsEmpty(OSRgn const &region) { return !pixman_region32_not_empty(Queried(region)); }

Rect Region::Bounds(OSRgn const &region) {
    return IsEmpty(region) ? Rect{0, 0, 0, 0} : FromBox(*pixman_region32_extents(Queried(region)));
}

std::vector<Rect> Region::Rects(OSRgn const &region) {
    int count = 0;
    pixman_box32_t const *boxes = pixman_region32_rectangles(Queried(region), &count);
    std::vector<Rect> result;
    result.reserve(static_cast<std::size_t>(count));
    for (int i = 0; i < count; ++i)
        result.push_back(FromBox(boxes[i]));
    return result;
}

long long Region::Area(OSRgn const &region) {
    long long area = 0;
    for (Rect const &r : Rects(region))
        area += static_cast<long long>(r.right - r.left) * (r.bottom - r.top);
    return area;
}

void Region::Clear(OSRgn &region) { pixman_region32_clear(Raw(region)); }

void Region::SetRect(OSRgn &region, Rect const &r) {
    if (IsEmptyRect(r)) {
        Clear(region);
        return;
    }
    pixman_box32_t box = {r.left, r.top, r.right, r.bottom};
    pixman_region32_reset(Raw(region), &box);
}

void Region::UniteRect(OSRgn &region, Rect const &r) {
    if (!IsEmptyRect(r))
        pixman_region32_union_rect(Raw(region), Raw(region), r.left, r.top, Width(r), Height(r));
}

void Region::Unite(OSRgn &region, OSRgn const &other) {
    pixman_region32_union(Raw(region), Raw(region), Queried(other));
}

void Region::IntersectRect(OSRgn &region, Rect const &r) {
    if (IsEmptyRect(r))
        Clear(region);
    else
        pixman_region32_intersect_rect(Raw(region), Raw(region), r.left, r.top, Width(r), Height(r));
}

void Region::Intersect(OSRgn &region, OSRgn const &other) {
    pixman_region32_intersect(Raw(region), Raw(region), Queried(other));
}

void Region::Subtract(OSRgn &region, OSRgn const &other) {
    pixman_region32_subtract(Raw(region), Raw(region), Queried(other));
}

void Region::Translate(OSRgn &region, int dh, int dv) { pixman_region32_translate(Raw(region), dh, dv); }

bool Region::Touches(OSRgn const &region, Rect const &r) {
    if (IsEmptyRect(r))
        return false;
    pixman_box32_t box = {r.left, r.top, r.right, r.bottom};
    return pixman_region32_contains_rectangle(Queried(region), &box) != PIXMAN_REGION_OUT;
}

bool Region::Is(OSRgn const &region, Rect const &r) {
    if (IsEmptyRect(r) || pixman_region32_n_rects(Queried(region)) != 1)
        return false;
    pixman_box32_t const &box = *pixman_region32_extents(Queried(region));
    return box.x1 == r.left && box.y1 == r.top && box.x2 == r.right && box.y2 == r.bottom;
}

bool Region::Equal(OSRgn const &a, OSRgn const &b) {
    return pixman_region32_equal(Queried(a), Queried(b)) != 0;
}
