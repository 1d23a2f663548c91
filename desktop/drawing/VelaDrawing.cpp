#include "host/VelaDrawing.h"
#include "desktop/drawing/Colors.h"
#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/LineDrawing.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/Region.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/observe/DrawingTrace.h"
#include <algorithm>
#include <cmath>

namespace {

DrawingPort *Port() { return DrawingPort::CurrentPort(); }

// Of no port: the state that every port starts with.
GraphicsState const &TextState(OSPort *port) {
    static GraphicsState const initial;
    return port ? static_cast<DrawingPort *>(port)->State() : initial;
}

void Trace(char const *operation) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call(operation));
}

void Trace(char const *operation, short h, short v) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call(operation).Integer("h", h).Integer("v", v));
}

void Trace(char const *operation, Rect const &r) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call(operation).Box("rect", r));
}

// A region by its bounds, and how many pixels it has where they are not all.
void Trace(char const *operation, OSRgn const *region) {
    if (!DrawingTrace::On())
        return;
    JsonLine line = DrawingTrace::Call(operation);
    if (region)
        line.Box("bounds", Region::Bounds(*region)).Integer("area", Region::Area(*region));
    else
        line.Raw("bounds", "null");
    DrawingTrace::Write(line);
}

void Trace(char const *operation, RGBColor const &color) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call(operation)
                                .Integer("red", color.red)
                                .Integer("green", color.green)
                                .Integer("blue", color.blue));
}

OSRgn ToWindow(DrawingPort const &port, OSRgn const &local) {
    OSRgn window(local);
    Region::Translate(window, port.OriginH(), port.OriginV());
    return window;
}

void FillRect(Rect const &r, OS::RGBAColor GraphicsState::*color) {
    DrawingPort *port = Port();
    if (!port)
        return;
    PixelScope pixels(*port);
    if (pixels.CanDraw())
        pixels.Fill(pixels.ToDevice(r), port->State().*color);
}

} // namespace

void VelaDrawing::GetPort(OSPort **port) { *port = Port(); }

void VelaDrawing::InsetRect(Rect *r, short dh, short dv) {
    *r = {SaturatedPixel(r->top + dv), SaturatedPixel(r->left + dh), SaturatedPixel(r->bottom - dv),
          SaturatedPixel(r->right - dh)};
}

void VelaDrawing::OffsetRect(Rect *r, short dh, short dv) {
    *r = {SaturatedPixel(r->top + dv), SaturatedPixel(r->left + dh), SaturatedPixel(r->bottom + dv),
          SaturatedPixel(r->right + dh)};
}

bool VelaDrawing::SectRect(Rect const *a, Rect const *b, Rect *out) {
    Rect shared = {std::max(a->top, b->top), std::max(a->left, b->left), std::min(a->bottom, b->bottom),
                   std::min(a->right, b->right)};
    bool const any = !EmptyRect(&shared);
    *out = any ? shared : Rect{0, 0, 0, 0};
    return any;
}

bool VelaDrawing::EmptyRect(Rect const *r) { return r->right <= r->left || r->bottom <= r->top; }

bool VelaDrawing::PtInRect(Point p, Rect const *r) {
    return p.h >= r->left && p.h < r->right && p.v >= r->top && p.v < r->bottom;
}

void VelaDrawing::Pt2Rect(Point a, Point b, Rect *r) {
    *r = {std::min(a.v, b.v), std::min(a.h, b.h), std::max(a.v, b.v), std::max(a.h, b.h)};
}

void VelaDrawing::PtToAngle(Rect const *r, Point p, short *angle) {
    constexpr double kHalfTurn = 180.0, kPi = 3.14159265358979323846;
    constexpr int kFullTurn = 360;
    double const width = std::max(r->right - r->left, 1), height = std::max(r->bottom - r->top, 1);
    double const h = (p.h - (r->left + r->right) / 2.0) / width;
    double const v = ((r->top + r->bottom) / 2.0 - p.v) / height;
    int const degrees = static_cast<int>(std::lround(std::atan2(h, v) * kHalfTurn / kPi));
    *angle = static_cast<short>((degrees + kFullTurn) % kFullTurn);
}

void VelaDrawing::AddPt(Point a, Point *sum) {
    *sum = {SaturatedPixel(sum->v + a.v), SaturatedPixel(sum->h + a.h)};
}

void VelaDrawing::GlobalToLocal(Point *p) {
    DrawingPort const *port = Port();
    if (!port)
        return;
    Point const place = port->ScreenPlace();
    *p = {SaturatedPixel(p->v - place.v - port->OriginV()), SaturatedPixel(p->h - place.h - port->OriginH())};
}

void VelaDrawing::LocalToGlobal(Point *p) {
    DrawingPort const *port = Port();
    if (!port)
        return;
    Point const place = port->ScreenPlace();
    *p = {SaturatedPixel(p->v + place.v + port->OriginV()), SaturatedPixel(p->h + place.h + port->OriginH())};
}

void VelaDrawing::MoveTo(short h, short v) {
    Trace("MoveTo", h, v);
    if (DrawingPort *port = Port())
        port->State().pen.location = {v, h};
}

void VelaDrawing::Move(short dh, short dv) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("Move").Integer("dh", dh).Integer("dv", dv));
    if (DrawingPort *port = Port())
        AddPt({dv, dh}, &port->State().pen.location);
}

void VelaDrawing::LineTo(short h, short v) {
    Trace("LineTo", h, v);
    DrawingPort *port = Port();
    if (!port)
        return;
    PenState &pen = port->State().pen;
    Point const to = {v, h};
    PixelScope pixels(*port);
    if (pixels.CanDraw())
        DrawLine(pixels, pen, to, port->State().fore);
    pen.location = to;
}

void VelaDrawing::FrameRect(Rect const *r) {
    Trace("FrameRect", *r);
    DrawingPort *port = Port();
    if (!port || EmptyRect(r))
        return;
    PixelScope pixels(*port);
    if (!pixels.CanDraw())
        return;
    Point const pen = port->State().pen.size;
    if (pen.h > 0 && pen.v > 0)
        pixels.FillFrame(
            pixels.ToDevice(*r),
            pixels.ToDevice(r->left + pen.h, r->top + pen.v, r->right - pen.h, r->bottom - pen.v),
            port->State().fore);
}

void VelaDrawing::PaintRect(Rect const *r) {
    Trace("PaintRect", *r);
    FillRect(*r, &GraphicsState::fore);
}

void VelaDrawing::EraseRect(Rect const *r) {
    Trace("EraseRect", *r);
    FillRect(*r, &GraphicsState::back);
}

void VelaDrawing::PenNormal() {
    Trace("PenNormal");
    if (DrawingPort *port = Port())
        port->State().PenNormal();
}

void VelaDrawing::GetPen(Point *p) {
    DrawingPort const *port = Port();
    *p = port ? port->State().pen.location : Point{0, 0};
}

void VelaDrawing::GetPenState(PenState *pen) {
    DrawingPort const *port = Port();
    *pen = port ? port->State().pen : GraphicsState().pen;
}

void VelaDrawing::SetPenState(PenState const *pen) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("SetPenState")
                                .Integer("h", pen->location.h)
                                .Integer("v", pen->location.v)
                                .Integer("width", pen->size.h)
                                .Integer("height", pen->size.v)
                                .Integer("mode", pen->mode)
                                .Integer("pattern", pen->pattern));
    if (DrawingPort *port = Port())
        port->State().pen = *pen;
}

void VelaDrawing::ClipRect(Rect const *r) {
    Trace("ClipRect", *r);
    if (DrawingPort *port = Port())
        port->SetClip(OSRgn(port->LocalToWindow(*r)));
}

void VelaDrawing::GetClip(OSRgn *region) {
    DrawingPort const *port = Port();
    if (!port) {
        Region::Clear(*region);
        return;
    }
    *region = port->Clip();
    Region::Translate(*region, -port->OriginH(), -port->OriginV());
}

void VelaDrawing::SetClip(OSRgn *region) {
    Trace("SetClip", region);
    if (DrawingPort *port = Port())
        port->SetClip(ToWindow(*port, *region));
}

void VelaDrawing::NarrowClip(OSRgn *region) {
    Trace("NarrowClip", region);
    DrawingPort *port = Port();
    if (port && region)
        port->NarrowClipTo(ToWindow(*port, *region));
}

void VelaDrawing::NarrowClipToRect(Rect const *r) {
    Trace("NarrowClipToRect", *r);
    if (DrawingPort *port = Port())
        port->NarrowClipTo(port->LocalToWindow(*r));
}

void VelaDrawing::InvalRect(Rect const *r) {
    Trace("InvalRect", *r);
    if (DrawingPort *port = Port())
        port->Damage(*r);
}

void VelaDrawing::InvalRgn(OSRgn *region) {
    Trace("InvalRgn", region);
    DrawingPort *port = Port();
    if (port && region)
        port->DamageWindow(ToWindow(*port, *region));
}

OSRgn *VelaDrawing::NewRgn() { return new OSRgn; }

void VelaDrawing::DisposeRgn(OSRgn *region) { delete region; }

void VelaDrawing::RectRgn(OSRgn *region, Rect const *r) { Region::SetRect(*region, *r); }

void VelaDrawing::UnionRgn(OSRgn *a, OSRgn *b, OSRgn *result) {
    OSRgn all(*a);
    Region::Unite(all, *b);
    *result = all;
}

void VelaDrawing::DiffRgn(OSRgn *a, OSRgn *b, OSRgn *result) {
    OSRgn rest(*a);
    Region::Subtract(rest, *b);
    *result = rest;
}

bool VelaDrawing::RectInRgn(Rect const *r, OSRgn *region) { return !region || Region::Touches(*region, *r); }

void VelaDrawing::RGBForeColor(RGBColor const &color) {
    Trace("RGBForeColor", color);
    if (DrawingPort *port = Port())
        port->State().SetFore(ToRGBA(color));
}

void VelaDrawing::RGBBackColor(RGBColor const &color) {
    Trace("RGBBackColor", color);
    if (DrawingPort *port = Port())
        port->State().back = ToRGBA(color);
}

void VelaDrawing::GetForeColor(RGBColor *color) {
    DrawingPort const *port = Port();
    *color = ToRGB(port ? port->State().fore : GraphicsState().fore);
}

void VelaDrawing::GetBackColor(RGBColor *color) {
    DrawingPort const *port = Port();
    *color = ToRGB(port ? port->State().back : GraphicsState().back);
}

void VelaDrawing::TextFont(OS::Font::FamilyID family) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("TextFont").Integer("family", family.GetOrderedFontID()));
    if (DrawingPort *port = Port())
        port->State().textFamily = family;
}

void VelaDrawing::TextSize(short size) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("TextSize").Integer("size", size));
    if (DrawingPort *port = Port())
        port->State().textSize = size;
}

void VelaDrawing::TextFace(short face) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("TextFace").Integer("face", face));
    if (DrawingPort *port = Port())
        port->State().textFace = face;
}

OS::Font::FamilyID VelaDrawing::GetPortTextFont(OSPort *port) { return TextState(port).textFamily; }

short VelaDrawing::GetPortTextSize(OSPort *port) { return TextState(port).textSize; }

int VelaDrawing::GetPortTextFace(OSPort *port) { return TextState(port).textFace; }
