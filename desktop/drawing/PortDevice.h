// What a port keeps about its surface between drawing calls.
#pragma once
#include "desktop/drawing/DrawingPort.h"
#include <cstdint>
#include <pixman.h>

struct DrawingPort::Device {
    Device();
    ~Device();
    Device(Device const &) = delete;
    Device &operator=(Device const &) = delete;

    void ForgetClip();
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

    bool IsColor(OS::RGBAColor const &c) const {
        return c.r == color.r && c.g == color.g && c.b == color.b && c.a == color.a;
    }

    // The last colour drawn in, as a premultiplied pixel.
    OS::RGBAColor color;
    std::uint32_t pixel = 0xFF000000u;
    bool solid = true; // has full alpha
};
