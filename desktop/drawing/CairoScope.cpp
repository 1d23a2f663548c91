#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/PortDevice.h"
#include "desktop/drawing/Surface.h"
#include <cairo.h>

CairoScope::CairoScope(DrawingPort &port_, Rect const &bounds)
    : port(port_)
    , context(nullptr) {
    if (!port.HasTarget() || !port.Visible(bounds))
        return;
    port.device->UpdateClip(port);
    Rect window = port.LocalToWindow(bounds);
    DeviceRect box = port.scale.ToDevice(window.left, window.top, window.right, window.bottom)
                         .Intersected(port.device->clipBounds);
    if (box.Empty())
        return;
    port.touched.Add(box);
    if (port.device->ground.Waits())
        port.device->ground.Prepare(box, port.device->clip);

    context = port.device->UpdateContext(port);
    if (port.surface)
        cairo_surface_mark_dirty(port.surface->CairoSurface()); // integer drawing may have changed the pixels
    cairo_save(context);
    cairo_scale(context, port.scale.Factor(), port.scale.Factor());
    cairo_translate(context, port.originH, port.originV);
    cairo_new_path(context);
    OS::RGBAColor ink = port.Ink();
    cairo_set_source_rgba(context, ink.r, ink.g, ink.b, ink.a);
    cairo_set_line_width(context, port.state.lineWidth);
}

CairoScope::~CairoScope() {
    if (!context)
        return;
    cairo_restore(context);
    if (port.surface)
        cairo_surface_flush(port.surface->CairoSurface());
    if (cairo_status(context) != CAIRO_STATUS_SUCCESS)
        port.device->ForgetSurface(); // a context that has failed once would draw nothing ever after
}
