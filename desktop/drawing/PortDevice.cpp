#include "desktop/drawing/PortDevice.h"
#include "desktop/drawing/ClipPath.h"
#include "desktop/drawing/Region.h"
#include "desktop/drawing/Surface.h"
#include <cairo.h>
#include <vector>

DrawingPort::Device::Device() { pixman_region32_init(&clip); }

DrawingPort::Device::~Device() {
    ForgetSurface();
    pixman_region32_fini(&clip);
    if (inkImage)
        pixman_image_unref(inkImage);
}

void DrawingPort::Device::ForgetClip() {
    clipKnown = false;
    contextClipKnown = false;
}

void DrawingPort::Device::ForgetSurface() {
    ForgetClip();
    ground.Forget();
    ForgetContext();
}

void DrawingPort::Device::ForgetContext() {
    if (context)
        cairo_destroy(context);
    context = nullptr;
}

void DrawingPort::Device::FindClip(DrawingPort const &port) {
    int count = 0;
    pixman_box32_t const *logical =
        pixman_region32_rectangles(const_cast<pixman_region32_t *>(Region::Raw(port.clip)), &count);
    auto toDevice = [&port](pixman_box32_t const &box) {
        DeviceRect r = port.scale.ToDevice(box.x1, box.y1, box.x2, box.y2);
        return pixman_box32_t{r.left, r.top, r.right, r.bottom};
    };
    if (count == 1 && !port.clipPath) { // by far the most common clip, and needs no allocation
        pixman_box32_t box = toDevice(logical[0]);
        pixman_region32_reset(&clip, &box);
    } else {
        std::vector<pixman_box32_t> boxes;
        for (int i = 0; i < count; ++i) {
            pixman_box32_t box = toDevice(logical[i]);
            if (box.x1 < box.x2 && box.y1 < box.y2) // scales below 1 swallow some logical pixels
                boxes.push_back(box);
        }
        pixman_region32_fini(&clip);
        pixman_region32_init_rects(&clip, boxes.data(), static_cast<int>(boxes.size()));
    }
    pixman_region32_intersect_rect(&clip, &clip, 0, 0, static_cast<unsigned>(port.DeviceWidth()),
                                   static_cast<unsigned>(port.DeviceHeight()));
    if (port.clipPath)
        pixman_region32_intersect(&clip, &clip, const_cast<pixman_region32_t *>(port.clipPath->Pixels()));
    pixman_box32_t const *extents = pixman_region32_extents(&clip);
    clipBounds = {extents->x1, extents->y1, extents->x2, extents->y2};
    clipIsBox = !port.page && pixman_region32_n_rects(&clip) <= 1;
    clipKnown = true;
}

cairo_t *DrawingPort::Device::UpdateContext(DrawingPort &port) {
    if (!context) {
        context = cairo_create(port.page ? port.page : port.surface->CairoSurface());
        contextClipKnown = false;
    }
    if (contextClipKnown)
        return context;
    cairo_reset_clip(context);
    int count = 0;
    pixman_box32_t const *boxes =
        pixman_region32_rectangles(const_cast<pixman_region32_t *>(Region::Raw(port.clip)), &count);
    // Not the device clip: that has the rough edge of the path, if there is one.
    cairo_new_path(context);
    for (int i = 0; i < count; ++i) {
        DeviceRect box = port.scale.ToDevice(boxes[i].x1, boxes[i].y1, boxes[i].x2, boxes[i].y2);
        cairo_rectangle(context, box.left, box.top, box.Width(), box.Height());
    }
    cairo_clip(context);
    if (port.clipPath)
        port.clipPath->Narrow(context);
    contextClipKnown = true;
    return context;
}
