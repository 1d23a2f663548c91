#include "desktop/drawing/LineDrawing.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/Region.h"
#include "desktop/drawing/WholePixels.h"
#include <algorithm>
#include <cstdlib>
#include <utility>

namespace {

// Calls draw(left, top, right, bottom) for each run of pixels that share a row or a column, `from` to `to`
// along the longer direction.
template <class Draw> void ForEachRun(Point from, Point to, Draw draw) {
    int const dh = std::abs(to.h - from.h), dv = std::abs(to.v - from.v);
    bool const flat = dh >= dv;
    int const length = std::max(dh, dv), rise = std::min(dh, dv);
    // Along the line upwards in number, so that it does not matter which end comes first.
    if (flat ? to.h < from.h : to.v < from.v)
        std::swap(from, to);
    int const start = flat ? from.h : from.v;
    int across = flat ? from.v : from.h;
    int const step = (flat ? to.v - from.v : to.h - from.h) < 0 ? -1 : 1;
    auto drawRun = [&](int begin, int end) {
        if (flat)
            draw(begin, across, end, across + 1);
        else
            draw(across, begin, across + 1, end);
    };
    int runStart = start;
    int error = length; // twice the distance of the ideal line from the edge where the next row begins
    for (int i = 0; i < length; ++i) {
        error -= 2 * rise;
        if (error < 0) {
            drawRun(runStart, start + i + 1);
            runStart = start + i + 1;
            across += step;
            error += 2 * length;
        }
    }
    drawRun(runStart, start + length + 1);
}

} // namespace

void DrawLine(PixelScope &pixels, PenState const &pen, Point to, OS::RGBAColor const &color) {
    int const penH = pen.size.h, penV = pen.size.v;
    if (penH <= 0 || penV <= 0)
        return;
    Point const &from = pen.location;
    int const left = std::min(from.h, to.h), right = std::max(from.h, to.h) + penH;
    int const top = std::min(from.v, to.v), bottom = std::max(from.v, to.v) + penV;
    DeviceRect const all = pixels.ToDevice(left, top, right, bottom);
    if (from.h == to.h || from.v == to.v) {
        pixels.Fill(all, color);
        return;
    }
    if (!pixels.Meets(all))
        return;
    if (penH == 1 && penV == 1) {
        ForEachRun(from, to,
                   [&](int l, int t, int r, int b) { pixels.Fill(pixels.ToDevice(l, t, r, b), color); });
        return;
    }
    OSRgn covered; // the places of a wide pen overlap
    ForEachRun(from, to, [&](int l, int t, int r, int b) {
        Region::UniteRect(covered, {SaturatedPixel(t), SaturatedPixel(l), SaturatedPixel(b - 1 + penV),
                                    SaturatedPixel(r - 1 + penH)});
    });
    for (Rect const &r : Region::Rects(covered))
        pixels.Fill(pixels.ToDevice(r), color);
}
