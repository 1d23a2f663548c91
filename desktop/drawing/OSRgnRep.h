// What stands behind an OSRgn.
#pragma once
#include "host/OSRgn.h"
#include <new>
#include <pixman.h>

// The way from a region to its representation, in logical pixels; for Region.h.
struct RegionAccess {
    static pixman_region32_t *Raw(OSRgn &region) {
        return std::launder(reinterpret_cast<pixman_region32_t *>(region.rep));
    }
    static pixman_region32_t const *Raw(OSRgn const &region) {
        return std::launder(reinterpret_cast<pixman_region32_t const *>(region.rep));
    }
    // Empty, to be freed by pixman_region32_fini.
    static pixman_region32_t *Make(OSRgn &region) {
        static_assert(sizeof(pixman_region32_t) <= sizeof(region.rep), "there is room for a region");
        static_assert(alignof(pixman_region32_t) <= alignof(void *), "a region may lie there");
        pixman_region32_t *const made = new (region.rep) pixman_region32_t;
        pixman_region32_init(made);
        return made;
    }
};
