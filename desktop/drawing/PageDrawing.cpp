#include "desktop/drawing/PageDrawing.h"
#include <cairo.h>
#include <pixman.h>

namespace {

// An image as Cairo takes it, in the same memory.
class ImagePattern {
public:
    ImagePattern(pixman_image_t *image, int left, int top, DeviceRect const &box) {
        bool const isMask = pixman_image_get_format(image) == PIXMAN_a8;
        cairo_surface_t *const surface = cairo_image_surface_create_for_data(
            reinterpret_cast<unsigned char *>(pixman_image_get_data(image)),
            isMask ? CAIRO_FORMAT_A8 : CAIRO_FORMAT_ARGB32, pixman_image_get_width(image),
            pixman_image_get_height(image), pixman_image_get_stride(image));
        pattern = cairo_pattern_create_for_surface(surface);
        cairo_surface_destroy(surface);
        cairo_matrix_t toImage;
        cairo_matrix_init_translate(&toImage, -left, -top);
        cairo_pattern_set_matrix(pattern, &toImage);
        int const right = left + pixman_image_get_width(image), bottom = top + pixman_image_get_height(image);
        if (!DeviceRect{left, top, right, bottom}.Contains(box))
            cairo_pattern_set_extend(pattern, CAIRO_EXTEND_REPEAT);
        cairo_pattern_set_filter(pattern, CAIRO_FILTER_NEAREST);
    }
    ~ImagePattern() { cairo_pattern_destroy(pattern); }
    ImagePattern(ImagePattern const &) = delete;
    ImagePattern &operator=(ImagePattern const &) = delete;
    cairo_pattern_t *Get() const { return pattern; }

private:
    cairo_pattern_t *pattern;
};

void SetSource(cairo_t *context, OS::RGBAColor const &color) {
    cairo_set_source_rgba(context, color.r, color.g, color.b, color.a);
}

// Draws within the box, with the context as it was afterwards.
template <class Draw> void Within(cairo_t *context, DeviceRect const &box, Draw draw) {
    if (box.Empty())
        return;
    cairo_save(context);
    cairo_new_path(context);
    cairo_rectangle(context, box.left, box.top, box.Width(), box.Height());
    draw();
    cairo_restore(context);
}

} // namespace

void PageDrawing::Fill(cairo_t *context, DeviceRect const &box, OS::RGBAColor const &color) {
    Within(context, box, [&] {
        SetSource(context, color);
        cairo_fill(context);
    });
}

void PageDrawing::DrawImage(cairo_t *context, pixman_image_t *image, int left, int top, DeviceRect const &box,
                            double alpha) {
    ImagePattern const pattern(image, left, top, box);
    Within(context, box, [&] {
        cairo_clip(context);
        cairo_set_source(context, pattern.Get());
        cairo_paint_with_alpha(context, alpha);
    });
}

void PageDrawing::FillThrough(cairo_t *context, pixman_image_t *mask, int left, int top,
                              DeviceRect const &box, OS::RGBAColor const &color) {
    ImagePattern const pattern(mask, left, top, box);
    Within(context, box, [&] {
        cairo_clip(context);
        SetSource(context, color);
        cairo_mask(context, pattern.Get());
    });
}
