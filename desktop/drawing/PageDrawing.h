// What is whole pixels in a window, on a page of paper.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "host/RGBColor.h"

typedef struct _cairo cairo_t; // NOLINT(bugprone-reserved-identifier): Cairo's own name
typedef union pixman_image pixman_image_t;

// Places are device pixels, which are the context's user space; its clip counts.
namespace PageDrawing {

void Fill(cairo_t *, DeviceRect const &, OS::RGBAColor const &);
// The image with its top left corner at the given place, as far as it lies in the box; repeated without end
// when it is smaller than the box.
void DrawImage(cairo_t *, pixman_image_t *, int left, int top, DeviceRect const &box, double alpha);
// In the colour as far as the image covers each pixel; laid out as above.
void FillThrough(cairo_t *, pixman_image_t *mask, int left, int top, DeviceRect const &box,
                 OS::RGBAColor const &);

} // namespace PageDrawing
