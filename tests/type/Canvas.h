// A port with pixels of its own, current for as long as it lives.
#pragma once
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/Surface.h"
#include <algorithm>
#include <cstdint>
#include <vector>

class Canvas {
public:
    // Logical pixels; white, drawing in black.
    Canvas(int width, int height, double scale_ = 1)
        : scale(scale_)
        , surface(scale.Edge(width), scale.Edge(height))
        , previous(DrawingPort::CurrentPort()) {
        port.SetSurface(&surface, scale);
        port.SetExtent(width, height);
        DrawingPort::MakeCurrent(&port);
        Erase();
    }
    ~Canvas() {
        DrawingPort::MakeCurrent(previous);
        port.SetSurface(nullptr, scale);
    }
    Canvas(Canvas const &) = delete;
    Canvas &operator=(Canvas const &) = delete;

    static constexpr std::uint32_t kWhite = 0xFFFFFFFF;

    DrawingPort &Port() { return port; }
    Surface const &Pixels() const { return surface; }
    void Erase() { std::fill_n(surface.Pixels(), PixelCount(), kWhite); }
    std::vector<std::uint32_t> Copy() const {
        return std::vector<std::uint32_t>(surface.Pixels(), surface.Pixels() + PixelCount());
    }
    bool IsBlank() const { return Ink().Empty(); }

    // The smallest device rectangle that holds all that is not white.
    DeviceRect Ink() const {
        DeviceRect ink = {surface.Width(), surface.Height(), 0, 0};
        for (int y = 0; y < surface.Height(); ++y) {
            for (int x = 0; x < surface.Width(); ++x) {
                if (surface.Row(y)[x] == kWhite)
                    continue;
                ink.left = std::min(ink.left, x);
                ink.right = std::max(ink.right, x + 1);
                ink.top = std::min(ink.top, y);
                ink.bottom = std::max(ink.bottom, y + 1);
            }
        }
        return ink;
    }

private:
    std::size_t PixelCount() const {
        return static_cast<std::size_t>(surface.Width()) * static_cast<std::size_t>(surface.Height());
    }
    DeviceScale scale;
    Surface surface;
    DrawingPort port;
    DrawingPort *previous;
};
