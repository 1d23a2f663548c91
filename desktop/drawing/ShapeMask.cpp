#include "desktop/drawing/ShapeMask.h"
#include <cairo.h>
#include <cstdint>
#include <pixman.h>

ShapeMask::ShapeMask(DeviceRect const &box_, Draw const &draw)
    : box(box_)
    , surface(cairo_image_surface_create(CAIRO_FORMAT_A8, box_.Width(), box_.Height()))
    , image(nullptr) {
    cairo_t *const context = cairo_create(surface);
    draw(context);
    cairo_destroy(context);
    cairo_surface_flush(surface);
    if (cairo_surface_status(surface) == CAIRO_STATUS_SUCCESS)
        image =
            pixman_image_create_bits(PIXMAN_a8, box.Width(), box.Height(),
                                     reinterpret_cast<std::uint32_t *>(cairo_image_surface_get_data(surface)),
                                     cairo_image_surface_get_stride(surface));
}

ShapeMask::~ShapeMask() {
    if (image)
        pixman_image_unref(image);
    cairo_surface_destroy(surface);
}
