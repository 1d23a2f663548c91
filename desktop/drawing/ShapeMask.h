// How much of each device pixel a smooth shape covers.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include <functional>
#include <memory>

typedef union pixman_image pixman_image_t;
typedef struct _cairo cairo_t;                 // NOLINT(bugprone-reserved-identifier): Cairo's own names
typedef struct _cairo_surface cairo_surface_t; // NOLINT(bugprone-reserved-identifier)

// Cairo cuts a path at the left and right edge of its clip, and what it then makes of the pixels beside a
// slope is not quite what it makes of them without. So shapes are not drawn under the clip: they become a
// mask first, which is the same whatever is damaged, and only the mask is clipped.
class ShapeMask {
public:
    // Draws in device pixels whose origin is the top left of the box; what lies outside of the box is lost.
    // The box must not depend on the clip.
    typedef std::function<void(cairo_t *)> Draw;
    ShapeMask(DeviceRect const &box, Draw const &);
    ~ShapeMask();
    ShapeMask(ShapeMask const &) = delete;
    ShapeMask &operator=(ShapeMask const &) = delete;

    DeviceRect const &Box() const { return box; }
    // Null when memory was wanting.
    pixman_image_t *Image() const { return image; }

private:
    DeviceRect box;
    cairo_surface_t *surface;
    pixman_image_t *image;
};
