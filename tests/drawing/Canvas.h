// A port with pixels to draw on, and ways to look at them.
#pragma once
#include "desktop/drawing/Colors.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/Region.h"
#include "desktop/drawing/Surface.h"
#include <cstdint>
#include <ostream>
#include <string>
#include <vector>

// Current as long as it lives. The pixels start white.
class Canvas {
public:
    Canvas(int width, int height, double factor = 1.0)
        : scale(factor)
        , surface(scale.Edge(width), scale.Edge(height)) {
        Wipe(kWhite);
        port.SetSurface(&surface, scale);
        port.SetExtent(width, height);
        DrawingPort::MakeCurrent(&port);
    }
    ~Canvas() { DrawingPort::MakeCurrent(nullptr); }

    static constexpr std::uint32_t kWhite = 0xFFFFFFFFu, kBlack = 0xFF000000u, kRed = 0xFFFF0000u;

    void Wipe(std::uint32_t pixel) {
        for (int y = 0; y < surface.Height(); ++y)
            for (int x = 0; x < surface.Width(); ++x)
                surface.Row(y)[x] = pixel;
    }
    // Every pixel different from its neighbours, and from what is drawn.
    void FillWithPattern() {
        for (int y = 0; y < surface.Height(); ++y)
            for (int x = 0; x < surface.Width(); ++x)
                surface.Row(y)[x] = 0xFF000000u | static_cast<std::uint32_t>(x * 7919 + y * 104729 + 12345);
    }
    std::uint32_t At(int x, int y) const { return surface.Row(y)[x]; }
    // A row of text for a row of pixels: '#' for the pixel asked for, '.' for any other.
    std::vector<std::string> Picture(std::uint32_t pixel = kBlack) const {
        std::vector<std::string> rows;
        for (int y = 0; y < surface.Height(); ++y) {
            std::string row;
            for (int x = 0; x < surface.Width(); ++x)
                row += At(x, y) == pixel ? '#' : '.';
            rows.push_back(row);
        }
        return rows;
    }
    int Count(std::uint32_t pixel) const {
        int count = 0;
        for (int y = 0; y < surface.Height(); ++y)
            for (int x = 0; x < surface.Width(); ++x)
                count += At(x, y) == pixel;
        return count;
    }
    std::vector<std::uint32_t> Pixels() const {
        return std::vector<std::uint32_t>(surface.Pixels(),
                                          surface.Pixels() + surface.Width() * surface.Height());
    }

    DeviceScale scale;
    Surface surface;
    DrawingPort port;
};

typedef std::vector<std::string> Rows;

inline OSRgn RegionOf(std::vector<Rect> const &rects) {
    OSRgn region;
    for (Rect const &r : rects)
        Region::UniteRect(region, r);
    return region;
}

inline bool operator==(Rect const &a, Rect const &b) {
    return a.top == b.top && a.left == b.left && a.bottom == b.bottom && a.right == b.right;
}

inline void PrintTo(Rect const &r, std::ostream *out) {
    *out << "{top " << r.top << ", left " << r.left << ", bottom " << r.bottom << ", right " << r.right
         << '}';
}
