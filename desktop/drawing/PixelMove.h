// Moving pixels within a surface.
#pragma once
#include "desktop/drawing/DeviceScale.h"

class Surface;
struct pixman_region32;

// A box of device pixels that got what stood `dx` pixels to the left of it and `dy` above.
struct PixelMove {
    DeviceRect to;
    int dx, dy;
    DeviceRect From() const { return {to.left - dx, to.top - dy, to.right - dx, to.bottom - dy}; }
};

// Copies to every pixel of the region, which must lie within the surface, what stands `dx` device pixels to
// the left of it and `dy` above; that must lie within the surface too. Source and destination may overlap.
void MovePixels(Surface &, pixman_region32 const &destination, int dx, int dy);
