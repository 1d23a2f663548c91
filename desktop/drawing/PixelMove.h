// Moving pixels within a surface.
#pragma once
#include <pixman.h>

class Surface;

// Copies to every pixel of the region, which must lie within the surface, what stands `dx` device pixels to
// the left of it and `dy` above; that must lie within the surface too. Source and destination may overlap.
void MovePixels(Surface &, pixman_region32_t const &destination, int dx, int dy);
