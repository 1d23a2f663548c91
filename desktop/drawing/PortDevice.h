// What a port keeps about its surface between drawing calls.
#pragma once
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/Ground.h"
#include <cstdint>
#include <pixman.h>

struct DrawingPort::Device {
    Device();
    ~Device();
    Device(Device const &) = delete;
    Device &operator=(Device const &) = delete;

    void ForgetClip();
    void ForgetContext();
    void ForgetSurface();
    // The boxes of the port's clip in device pixels, and the smallest box around them. Cached until
    // ForgetClip.
    void UpdateClip(DrawingPort const &port) {
        if (!clipKnown)
            FindClip(port);
    }
    // A context with the port's clip, in device pixels, without any other state that matters.
    cairo_t *UpdateContext(DrawingPort &);

    void FindClip(DrawingPort const &);

    bool clipKnown = false;
    DeviceRect clipBounds{0, 0, 0, 0};
    pixman_region32_t clip;
    bool clipIsBox = false; // of pixels: they can be written without looking for their part of the clip

    cairo_t *context = nullptr;
    bool contextClipKnown = false;

    static bool Same(OS::RGBAColor const &a, OS::RGBAColor const &b) {
        return a.r == b.r && a.g == b.g && a.b == b.b && a.a == b.a;
    }
    bool IsColor(OS::RGBAColor const &c) const { return Same(c, color); }

    // The last colour drawn in, as a premultiplied pixel.
    OS::RGBAColor color;
    std::uint32_t pixel = 0xFF000000u;
    bool solid = true; // has full alpha

    Ground ground; // of the surface

    // The last ink that glyphs were drawn in, and an image of nothing else; null before there was any.
    OS::RGBAColor ink;
    pixman_image_t *inkImage = nullptr;
};
