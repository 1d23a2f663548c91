// Frames and shadows: shades laid over what is beneath, so that they look right in every theme.
#include "desktop/drawing/Colors.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/ThemeColors.h"
#include "desktop/observe/DrawingTrace.h"
#include "host/VelaDrawing.h"
#include <algorithm>
#include <cstdlib>
#include <utility>

namespace {

constexpr int kWhitePercent = 100;

// How much darker or lighter than the gray of a bevel its sides are, in percent of white.
// A dark gray has less room below it.
constexpr int kBevelShade = 22, kBevelLight = 14;

// Strength of a list's inner shadow from its edge inwards, a value for each pixel.
constexpr double kShadowAlpha[] = {0.20, 0.11, 0.05, 0.02};
constexpr int kShadowDepth = static_cast<int>(sizeof kShadowAlpha / sizeof kShadowAlpha[0]);

// Text wells: how much the outline differs from the paper, and the shade below its upper edge.
constexpr double kWellBorderAlpha = 0.42, kWellTopBorderAlpha = 0.10, kWellShadowAlpha = 0.06;

OS::RGBAColor Shade(double alpha) { return {0, 0, 0, alpha}; }

// Black on light paper, white on dark.
OS::RGBAColor Outline(double alpha) {
    double ink = ThemeColors::IsDark() ? 1.0 : 0.0;
    return {ink, ink, ink, alpha};
}

// One ring of a bevel. The lighter colour is at the bottom right when sunken; each corner belongs to the
// darker sides.
void DrawBevelRing(PixelScope &pixels, Rect const &r, OS::RGBAColor const &topLeft,
                   OS::RGBAColor const &bottomRight) {
    pixels.Fill(pixels.ToDevice(r.left, r.top, r.right - 1, r.top + 1), topLeft);
    pixels.Fill(pixels.ToDevice(r.left, r.top + 1, r.left + 1, r.bottom - 1), topLeft);
    pixels.Fill(pixels.ToDevice(r.right - 1, r.top, r.right, r.bottom - 1), bottomRight);
    pixels.Fill(pixels.ToDevice(r.left, r.bottom - 1, r.right, r.bottom), bottomRight);
}

} // namespace

void Frame3DRect(Rect const *r, short depth, short gray) {
    if (DrawingTrace::On())
        DrawingTrace::Write(
            DrawingTrace::Call("Frame3DRect").Box("rect", *r).Integer("depth", depth).Integer("gray", gray));
    DrawingPort *port = DrawingPort::CurrentPort();
    if (!port)
        return;
    PixelScope pixels(*port);
    if (!pixels.CanDraw())
        return;
    int const level = ThemeColors::IsDark() ? kWhitePercent - gray : gray;
    OS::RGBAColor topLeft = ToRGBA(GrayOf(level + kBevelLight));
    OS::RGBAColor bottomRight = ToRGBA(GrayOf(level - std::min(kBevelShade, level / 2)));
    if (depth < 0)
        std::swap(topLeft, bottomRight);
    Rect ring = *r;
    for (int i = std::abs(depth); i > 0 && !VelaDrawing::EmptyRect(&ring); --i) {
        DrawBevelRing(pixels, ring, topLeft, bottomRight);
        VelaDrawing::InsetRect(&ring, 1, 1);
    }
}

void DrawShadowLine(Point a, Point b) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("DrawShadowLine").Spot("from", a).Spot("to", b));
    DrawingPort *port = DrawingPort::CurrentPort();
    if (!port)
        return;
    PixelScope pixels(*port);
    if (!pixels.CanDraw())
        return;
    Rect edge;
    VelaDrawing::Pt2Rect(a, b, &edge);
    if (edge.top == edge.bottom) {
        for (int i = 0; i < kShadowDepth; ++i)
            pixels.Fill(pixels.ToDevice(edge.left, edge.top + i, edge.right, edge.top + i + 1),
                        Shade(kShadowAlpha[i]));
    } else if (edge.left == edge.right) {
        for (int i = 0; i < kShadowDepth; ++i)
            pixels.Fill(pixels.ToDevice(edge.left + i, edge.top, edge.left + i + 1, edge.bottom),
                        Shade(kShadowAlpha[i]));
    }
}

void FrameTextWell(Rect const &r) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("FrameTextWell").Box("rect", r));
    DrawingPort *port = DrawingPort::CurrentPort();
    if (!port || VelaDrawing::EmptyRect(&r))
        return;
    PixelScope pixels(*port);
    if (!pixels.CanDraw())
        return;
    // As thick on every side, wherever the edges are rounded to.
    int const line = std::max(1, port->Scale().Edge(1));
    DeviceRect const outer = pixels.ToDevice(r);
    DeviceRect const inside = {outer.left + line, outer.top + line, outer.right - line, outer.bottom - line};
    pixels.FillFrame(outer, inside, Outline(kWellBorderAlpha));
    // The well lies deeper than its surroundings: light from above leaves its upper edge in the shade.
    pixels.Fill({outer.left, outer.top, outer.right, std::min(outer.top + line, outer.bottom)},
                Shade(kWellTopBorderAlpha));
    if (inside.Empty())
        return;
    // Text begins a little inside of the frame, and its paper with it.
    Rect text = r;
    VelaDrawing::InsetRect(&text, 2, 2);
    DeviceRect const paper = pixels.ToDevice(text);
    pixels.FillFrame(inside, paper, ToRGBA(kTextWellBackgroundColor));
    int const below = paper.Empty() ? inside.bottom : paper.top;
    pixels.Fill({inside.left, inside.top, inside.right, std::min(inside.top + line, below)},
                Shade(kWellShadowAlpha));
}
