// Drawing in whole device pixels.
#pragma once
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/PlacedGlyphs.h"
#include "desktop/drawing/PortDevice.h"
#include "desktop/drawing/Surface.h"
#include <cstdint>
#include <pixman.h>

// An image as it lies in memory, and what is known of it.
struct PixelImage {
    pixman_image_t *pixels = nullptr; // not owned
    int width = 0, height = 0;        // device pixels
    bool opaque = false;              // every pixel has full alpha
    bool empty = true;                // no pixel has any: there is nothing to draw
    // What has full alpha, where all else has none and that is known; empty otherwise.
    DeviceRect solid = {0, 0, 0, 0};
};

// The way from local coordinates onto a port's surface, for the duration of one drawing call. Cuts to the
// clip, and notes what has been drawn on. Nothing here is anti-aliased. The state's darkening applies to
// everything.
class PixelScope {
public:
    explicit PixelScope(DrawingPort &port_)
        : port(port_)
        , device(nullptr) {
        if (!port.HasTarget())
            return;
        port.device->UpdateClip(port);
        if (!port.device->clipBounds.Empty())
            device = port.device.get();
    }

    // False when nothing at all can show; nothing else may be called then.
    bool CanDraw() const { return device != nullptr; }
    DeviceRect ToDevice(Rect const &local) const {
        return ToDevice(local.left, local.top, local.right, local.bottom);
    }
    DeviceRect ToDevice(int left, int top, int right, int bottom) const {
        return port.scale.ToDevice(left + port.originH, top + port.originV, right + port.originH,
                                   bottom + port.originV);
    }
    // Whether any pixel of the box could show.
    bool Meets(DeviceRect const &r) const { return !r.Intersected(device->clipBounds).Empty(); }

    // In the given colour, over what is beneath if the colour is transparent.
    void Fill(DeviceRect const &r, OS::RGBAColor const &color) {
        DeviceRect const box = r.Intersected(device->clipBounds);
        if (box.Empty())
            return;
        // By far the most rectangles and lines are of the same solid colour as the one before, and meet a
        // clip of one box.
        if (device->clipIsBox && device->solid && device->IsColor(color) && port.state.darken == 0) {
            port.touched.Add(box);
            if (device->ground.Waits())
                device->ground.Cover(box, device->clip);
            port.surface->Fill(box, device->pixel);
        } else {
            FillBox(box, port.state.darken != 0 ? port.Ink() : color);
        }
    }
    // All of the clip, without regard to darkening.
    void Cover(OS::RGBAColor const &);
    // The same, as the ground of what is drawn next, in a colour that is opaque.
    void LayGround(OS::RGBAColor const &);
    // The four bars between the outer and the inner box, which must not reach beyond the outer. An empty
    // inner box fills all.
    void FillFrame(DeviceRect const &outer, DeviceRect const &inner, OS::RGBAColor const &);
    // The image with its top left corner at the given place, as far as it lies in the box; repeated without
    // end when it is smaller than the box. Faded if the state says so and `fades` is true.
    void DrawImage(PixelImage const &, int left, int top, DeviceRect const &box, bool fades);

    // In the given colour as far as the mask covers each pixel; the box's top left corner takes the mask's
    // pixel at the given place. A null mask draws nothing.
    void FillThrough(pixman_image_t *mask, int fromH, int fromV, DeviceRect const &box,
                     OS::RGBAColor const &);

    // Whether glyphs can be drawn as masks: not on paper, nor where the clip has smooth edges.
    bool TakesGlyphs() const { return !port.page && !port.clipPath; }
    // Of a point in local coordinates, in device pixels.
    double GlyphH(double h) const { return (h + port.originH) * port.scale.Factor(); }
    double GlyphV(double v) const { return (v + port.originV) * port.scale.Factor(); }
    // In the ink of the port, as far as they lie in `cut`.
    void DrawGlyphs(PlacedGlyphs const &, DeviceRect const &cut);

private:
    void FillBox(DeviceRect const &, OS::RGBAColor const &);
    pixman_image_t *InkImage(); // null when memory was wanting
    // Whether what is drawn leaves nothing of what was there before.
    enum class Hides { kAll, kNotAll };
    template <class Draw> void ForEachVisible(DeviceRect const &, Hides, Draw);
    void PrepareGround(DeviceRect const &visible, Hides);
    void FindPixel(OS::RGBAColor const &);

    DrawingPort &port;
    DrawingPort::Device *device;
};
