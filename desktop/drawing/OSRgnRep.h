// What stands behind an OSRgn.
#pragma once
#include "host/OSRgn.h"
#include <pixman.h>

struct OSRgn::Rep {
    pixman_region32_t region; // logical pixels
};

// The way from a region to its representation, for Region.h.
struct RegionAccess {
    static pixman_region32_t *Raw(OSRgn &region) { return &region.rep->region; }
    static pixman_region32_t const *Raw(OSRgn const &region) { return &region.rep->region; }
};
