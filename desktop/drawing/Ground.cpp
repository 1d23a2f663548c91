#include "desktop/drawing/Ground.h"
#include "desktop/drawing/Surface.h"

// To keep account of more pieces costs more than the pixels are worth.
static int const kMostPieces = 24;

static pixman_box32_t BoxOf(DeviceRect const &r) { return {r.left, r.top, r.right, r.bottom}; }

Ground::Ground() { pixman_region32_init(&rest); }

Ground::~Ground() { pixman_region32_fini(&rest); }

void Ground::Begin(Surface &on, pixman_region32_t const &where, std::uint32_t pixel_) {
    surface = &on;
    pixel = pixel_;
    if (!pixman_region32_copy(&rest, const_cast<pixman_region32_t *>(&where)) ||
        !pixman_region32_not_empty(&rest)) {
        Lay(where);
        Forget();
    }
}

bool Ground::WaitsIn(DeviceRect const &r) const {
    pixman_box32_t box = BoxOf(r);
    return pixman_region32_contains_rectangle(const_cast<pixman_region32_t *>(&rest), &box) !=
           PIXMAN_REGION_OUT;
}

void Ground::Cover(DeviceRect const &box, pixman_region32_t const &clip) {
    if (!WaitsIn(box))
        return;
    pixman_region32_t covered;
    pixman_region32_init(&covered);
    if (pixman_region32_intersect_rect(&covered, const_cast<pixman_region32_t *>(&clip), box.left, box.top,
                                       static_cast<unsigned>(box.Width()),
                                       static_cast<unsigned>(box.Height())))
        Subtract(covered);
    else
        Finish();
    pixman_region32_fini(&covered);
}

void Ground::Prepare(DeviceRect const &box, pixman_region32_t const &clip) {
    if (!WaitsIn(box))
        return;
    pixman_region32_t part;
    pixman_region32_init(&part);
    if (pixman_region32_intersect(&part, &rest, const_cast<pixman_region32_t *>(&clip))) {
        Lay(part);
        Subtract(part);
    } else {
        Finish();
    }
    pixman_region32_fini(&part);
}

void Ground::Finish() {
    if (!Waits())
        return;
    Lay(rest);
    Forget();
}

void Ground::Forget() {
    surface = nullptr;
    pixman_region32_clear(&rest);
}

void Ground::Lay(pixman_region32_t const &region) {
    int count = 0;
    pixman_box32_t const *box = pixman_region32_rectangles(const_cast<pixman_region32_t *>(&region), &count);
    for (pixman_box32_t const *const end = box + count; box != end; ++box)
        surface->Fill({box->x1, box->y1, box->x2, box->y2}, pixel);
}

void Ground::Subtract(pixman_region32_t const &region) {
    bool const done = pixman_region32_subtract(&rest, &rest, const_cast<pixman_region32_t *>(&region));
    if (!done || pixman_region32_n_rects(&rest) > kMostPieces)
        Finish();
    else if (!pixman_region32_not_empty(&rest))
        Forget();
}
