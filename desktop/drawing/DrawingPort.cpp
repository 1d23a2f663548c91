#include "desktop/drawing/DrawingPort.h"
#include "desktop/drawing/ClipPath.h"
#include "desktop/drawing/Colors.h"
#include "desktop/drawing/PathDrawing.h"
#include "desktop/drawing/PixelMove.h"
#include "desktop/drawing/PixelScope.h"
#include "desktop/drawing/PortDevice.h"
#include "desktop/drawing/Region.h"
#include "desktop/drawing/RoundCorners.h"
#include "desktop/drawing/ShapeMask.h"
#include "desktop/drawing/Surface.h"
#include "desktop/drawing/WholePixels.h"
#include "desktop/observe/DrawingTrace.h"
#include <algorithm>
#include <boost/assert.hpp>
#include <cairo.h>
#include <cmath>

namespace {

constexpr double kPercent = 100.0;
constexpr double kWidestLine = 1000.0;
// How many line widths a sharp bend may reach beyond its corner: half of Cairo's limit, which counts from
// side to side.
constexpr double kFarthestMiter = 5.0;
constexpr PenState kNormalPen = {{0, 0}, {1, 1}, 0, 0};

JsonLine Call(char const *operation, OS::RectBase<OS::RectTag> const &r) {
    JsonLine line = DrawingTrace::Call(operation);
    line.Number("h", r.origin.x).Number("v", r.origin.y);
    line.Number("width", r.size.width).Number("height", r.size.height);
    return line;
}

void Trace(char const *operation, OS::RectBase<OS::RectTag> const &r) {
    if (DrawingTrace::On())
        DrawingTrace::Write(Call(operation, r));
}

void Trace(char const *operation, OS::RectBase<OS::RectTag> const &r, OS::Size const &corner) {
    if (DrawingTrace::On())
        DrawingTrace::Write(
            Call(operation, r).Number("cornerWidth", corner.width).Number("cornerHeight", corner.height));
}

// One for each open window; a handful.
std::vector<DrawingPort *> &LivePorts() {
    static std::vector<DrawingPort *> ports;
    return ports;
}

unsigned long NextSerial() {
    static unsigned long last = 0;
    return ++last;
}

// Width of a frame's line in device pixels; a line never vanishes.
int LineWidth(double lineWidth, DeviceScale scale) {
    return std::max(1, static_cast<int>(std::lround(lineWidth * scale.Factor())));
}

// Inside of the frame that the rectangle and the line width make.
DeviceRect Inside(DeviceRect const &r, double lineWidth, DeviceScale scale) {
    int const line = LineWidth(lineWidth, scale);
    return {r.left + line, r.top + line, r.right - line, r.bottom - line};
}

// Radius in device pixels of a corner whose ellipse has the given diameter in logical ones.
double Radius(double diameter, DeviceScale scale) {
    return std::max(0.0, FiniteCoordinate(diameter) / 2 * scale.Factor());
}

} // namespace

DrawingPort *DrawingPort::current = nullptr;

DrawingPort::DrawingPort()
    : surface(nullptr)
    , page(nullptr)
    , extent{0, 0, 0, 0}
    , originH(0)
    , originV(0)
    , device(new Device)
    , serial(NextSerial()) {
    LivePorts().push_back(this);
}

DrawingPort::~DrawingPort() {
    std::vector<DrawingPort *> &ports = LivePorts();
    ports.erase(std::remove(ports.begin(), ports.end(), this), ports.end());
    if (current == this)
        current = nullptr;
}

DrawingPort *DrawingPort::Alive(OSPort *port) {
    std::vector<DrawingPort *> const &ports = LivePorts();
    auto found = std::find(ports.begin(), ports.end(), port);
    return found == ports.end() ? nullptr : *found;
}

void DrawingPort::SetPage(cairo_surface_t *newPage, DeviceScale newScale) {
    SetSurface(nullptr, newScale);
    page = newPage;
}

int DrawingPort::DeviceWidth() const { return surface ? surface->Width() : scale.Edge(extent.right); }

int DrawingPort::DeviceHeight() const { return surface ? surface->Height() : scale.Edge(extent.bottom); }

void DrawingPort::SetSurface(Surface *newSurface, DeviceScale newScale) {
    surface = newSurface;
    page = nullptr;
    scale = newScale;
    clipPath.reset(); // is bound to the old device pixels
    TakeTouched();
    device->ForgetSurface();
}

void DrawingPort::ExchangeSurface(Surface &other) {
    FinishGround();
    surface = &other;
    device->ForgetContext();
}

void DrawingPort::SetExtent(int width, int height) {
    extent = {0, 0, SaturatedPixel(std::max(height, 0)), SaturatedPixel(std::max(width, 0))};
    Region::IntersectRect(damage, extent);
    SetBoundary(OSRgn(extent));
}

void DrawingPort::SetOrigin(int h, int v) {
    originH = SaturatedPixel(h);
    originV = SaturatedPixel(v);
}

void DrawingPort::ClipChanged() { device->ForgetClip(); }

void DrawingPort::SetBoundary(OSRgn const &region) {
    boundary = region;
    Region::IntersectRect(boundary, extent);
    clip = boundary;
    clipPath.reset();
    ClipChanged();
}

void DrawingPort::SetBoundary(Rect const &r) {
    if (clipPath || !Region::Is(boundary, r) || !Region::Is(clip, r))
        SetBoundary(OSRgn(r));
}

void DrawingPort::CutClip(OSRgn const &region) {
    clip = region;
    Region::Intersect(clip, boundary);
    ClipChanged();
}

void DrawingPort::SetClip(OSRgn const &region) {
    clipPath.reset();
    CutClip(region);
}

void DrawingPort::SetClipState(ClipState const &kept) {
    clipPath = kept.path;
    CutClip(kept.region);
}

// Mostly nothing has changed meanwhile; then the clip in device pixels stays too.
void DrawingPort::SetPlace(PortPlace const &kept) {
    SetOrigin(kept.originH, kept.originV);
    if (clipPath == kept.clip.path && Region::Equal(clip, kept.clip.region) &&
        Region::Equal(boundary, kept.boundary))
        return;
    SetBoundary(kept.boundary);
    SetClipState(kept.clip);
}

void DrawingPort::LayGround(OS::RGBAColor const &color) {
    PixelScope scope(*this);
    if (scope.CanDraw())
        scope.LayGround(color);
}

void DrawingPort::FinishGround() { device->ground.Finish(); }

void DrawingPort::NarrowClipTo(Rect const &window) {
    Region::IntersectRect(clip, window);
    ClipChanged();
}

void DrawingPort::NarrowClipTo(OSRgn const &window) {
    Region::Intersect(clip, window);
    ClipChanged();
}

bool DrawingPort::Visible(Rect const &local) const { return Region::Touches(clip, LocalToWindow(local)); }

OS::RGBAColor DrawingPort::Ink() const {
    // Black of some strength over anything is that thing made darker by the strength.
    return state.darken != 0 ? OS::RGBAColor(0, 0, 0, state.darken / kPercent) : state.fore;
}

void DrawingPort::Damage(Rect const &local) { DamageWindow(LocalToWindow(local)); }

void DrawingPort::DamageWindow(Rect window) {
    if (VelaDrawing::SectRect(&window, &extent, &window))
        Region::UniteRect(damage, window);
}

void DrawingPort::DamageWindow(OSRgn const &region) {
    OSRgn inside(region);
    Region::IntersectRect(inside, extent);
    Region::Unite(damage, inside);
}

OSRgn DrawingPort::TakeDamage() {
    OSRgn taken(damage);
    Region::Clear(damage);
    return taken;
}

bool DrawingPort::HasWork() const { return move || !touched.Empty() || !Region::IsEmpty(damage); }

Rect DrawingPort::LocalToWindow(Rect const &r) const {
    return {SaturatedPixel(r.top + originV), SaturatedPixel(r.left + originH),
            SaturatedPixel(r.bottom + originV), SaturatedPixel(r.right + originH)};
}

Rect DrawingPort::WindowToLocal(Rect const &r) const {
    return {SaturatedPixel(r.top - originV), SaturatedPixel(r.left - originH),
            SaturatedPixel(r.bottom - originV), SaturatedPixel(r.right - originH)};
}

void DrawingPort::FrameRect(OS::RectBase<OS::RectTag> const &r) {
    Trace("FrameRect", r);
    PixelScope pixels(*this);
    if (!pixels.CanDraw())
        return;
    DeviceRect outer = pixels.ToDevice(WholeRect(r));
    pixels.FillFrame(outer, Inside(outer, state.lineWidth, scale), state.fore);
}

// Under a path as clip the edges of both have to be smooth, which only Cairo can do. On a page shapes stay
// shapes.
void DrawingPort::DrawSmooth(Rect const &bounds, std::function<void(cairo_t *)> const &draw) {
    if (clipPath || page) {
        CairoScope const scope(*this, bounds);
        if (scope.Context())
            draw(scope.Context());
        return;
    }
    PixelScope pixels(*this);
    if (!pixels.CanDraw())
        return;
    DeviceRect const box = pixels.ToDevice(bounds).Intersected({0, 0, DeviceWidth(), DeviceHeight()});
    if (box.Empty() || !pixels.Meets(box))
        return;
    ShapeMask const mask(box, [&](cairo_t *context) {
        cairo_translate(context, -box.left, -box.top);
        cairo_scale(context, scale.Factor(), scale.Factor());
        cairo_translate(context, originH, originV);
        cairo_set_line_width(context, state.lineWidth);
        draw(context);
    });
    pixels.FillThrough(mask.Image(), 0, 0, box, state.fore);
}

// Outlines on whole device pixels keep the straight parts sharp at every scale.
void DrawingPort::DrawRoundRect(Rect const &bounds, OS::Size const &corner, int line) {
    double const radiusH = Radius(corner.width, scale), radiusV = Radius(corner.height, scale);
    Rect const window = LocalToWindow(bounds);
    DeviceRect const outer = scale.ToDevice(window.left, window.top, window.right, window.bottom);
    if (!clipPath && !page) {
        PixelScope pixels(*this);
        if (pixels.CanDraw())
            RoundCorners{radiusH, radiusV, line}.Draw(pixels, outer, state.fore);
        return;
    }
    DrawSmooth(bounds, [&](cairo_t *context) {
        cairo_identity_matrix(context);
        RoundCorners{radiusH, radiusV, line}.AppendPath(context, outer);
        cairo_fill(context);
    });
}

void DrawingPort::FrameRoundRect(OS::RectBase<OS::RectTag> const &r, OS::Size const &corner) {
    Trace("FrameRoundRect", r, corner);
    DrawRoundRect(WholeRect(r), corner, LineWidth(state.lineWidth, scale));
}

void DrawingPort::PaintRoundRect(OS::RectBase<OS::RectTag> const &r, OS::Size const &corner) {
    Trace("PaintRoundRect", r, corner);
    DrawRoundRect(WholeRect(r), corner, 0);
}

void DrawingPort::PaintOval(OS::RectBase<OS::RectTag> const &r) {
    Trace("PaintOval", r);
    Rect bounds = WholeRect(r);
    VelaDrawing::InsetRect(&bounds, -1, -1); // the ellipse keeps its fractions, which rounding may have cut
    double const left = FiniteCoordinate(std::min(r.origin.x, r.origin.x + r.size.width));
    double const top = FiniteCoordinate(std::min(r.origin.y, r.origin.y + r.size.height));
    DrawSmooth(bounds, [&](cairo_t *context) {
        PathDrawing::AppendOval(context, left, top, FiniteCoordinate(std::abs(r.size.width)),
                                FiniteCoordinate(std::abs(r.size.height)));
        cairo_fill(context);
    });
}

void DrawingPort::StrokePath(OSPath const &path) {
    if (DrawingTrace::On())
        DrawingTrace::Write(PathDrawing::Described("StrokePath", path));
    DrawSmooth(PathDrawing::Bounds(path, state.lineWidth * kFarthestMiter + 1), [&](cairo_t *context) {
        PathDrawing::Append(context, path);
        cairo_stroke(context);
    });
}

void DrawingPort::SetForeColor(OS::RGBAColor const &color) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("SetForeColor")
                                .Number("red", color.r)
                                .Number("green", color.g)
                                .Number("blue", color.b)
                                .Number("alpha", color.a));
    state.SetFore(color);
}

void DrawingPort::SetLineWidth(double width) {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("SetLineWidth").Number("width", width));
    state.lineWidth = width > 0 ? std::min(width, kWidestLine) : 0.0; // what is not a number gives 0
}

void DrawingPort::NarrowClip(OS::RectBase<OS::RectTag> const &r) {
    Trace("NarrowClip", r);
    NarrowClipTo(LocalToWindow(WholeRect(r)));
}

void DrawingPort::NarrowClipPath(OSPath const &path) {
    if (DrawingTrace::On())
        DrawingTrace::Write(PathDrawing::Described("NarrowClipPath", path));
    if (!HasTarget())
        return;
    clipPath = std::make_shared<ClipPath const>(path, originH, originV, scale, DeviceWidth(), DeviceHeight(),
                                                clipPath);
    ClipChanged();
}

void DrawingPort::PenNormal() {
    if (DrawingTrace::On())
        DrawingTrace::Write(DrawingTrace::Call("PenNormal"));
    state.PenNormal();
}

void GraphicsState::PenNormal() {
    Point location = pen.location;
    pen = kNormalPen;
    pen.location = location;
    lineWidth = 1.0;
}

void DrawingPort::ScrollRect(OS::RectBase<OS::RectTag> const &r, OS::Size const &distance) {
    int const dh = WholePixel(distance.width), dv = WholePixel(distance.height);
    if (DrawingTrace::On())
        DrawingTrace::Write(Call("ScrollRect", r).Number("dh", distance.width).Number("dv", distance.height));
    if (dh == 0 && dv == 0)
        return;
    OSRgn area(clip);
    Region::IntersectRect(area, LocalToWindow(WholeRect(r)));
    if (!surface || clipPath || !scale.MovesExactly(dh) || !scale.MovesExactly(dv)) {
        Region::Unite(damage, area); // pixels would not land on pixels, or nobody knows which ones are there
        return;
    }
    OSRgn reached(area); // the pixels that get the picture of other ones
    Region::Translate(reached, dh, dv);
    Region::Intersect(reached, area);
    MoveDevicePixels(reached, dh, dv);

    // What waited to be redrawn waits where it is now; what nothing moved into is new.
    OSRgn moved(damage);
    Region::Intersect(moved, area);
    Region::Translate(moved, dh, dv);
    Region::Intersect(moved, reached);
    Region::Subtract(damage, area);
    Region::Unite(damage, moved);
    Region::Subtract(area, reached);
    Region::Unite(damage, area);
}

// Window coordinates; both distances have to move exactly.
void DrawingPort::MoveDevicePixels(OSRgn const &destination, int dh, int dv) {
    int const dx = scale.Edge(dh), dy = scale.Edge(dv);
    DeviceRect const whole = {0, 0, surface->Width(), surface->Height()};
    DeviceRect const source = {dx, dy, whole.right + dx,
                               whole.bottom + dy}; // where there is something to copy
    std::vector<pixman_box32_t> boxes;
    for (Rect const &r : Region::Rects(destination)) {
        DeviceRect box =
            scale.ToDevice(r.left, r.top, r.right, r.bottom).Intersected(whole).Intersected(source);
        if (!box.Empty())
            boxes.push_back({box.left, box.top, box.right, box.bottom});
    }
    if (boxes.empty())
        return;
    NoteMove(boxes, dx, dy);
    FinishGround();
    if (boxes.size() == 1 && dx == 0 &&
        ScrollPixels({boxes[0].x1, boxes[0].y1, boxes[0].x2, boxes[0].y2}, dy))
        return;
    pixman_region32_t region;
    pixman_region32_init_rects(&region, boxes.data(), static_cast<int>(boxes.size()));
    MovePixels(*surface, region, dx, dy);
    pixman_region32_fini(&region);
}

// False where it is not worth while.
bool DrawingPort::ScrollPixels(DeviceRect const &to, int dy) {
    int const kLeastPixels = 0x8000; // that moving takes longer for than all else
    DeviceRect const from = PixelMove{to, 0, dy}.From(), all = to.United(from);
    if (!surface->Scrolls() || to.Width() * to.Height() < kLeastPixels || 2 * std::abs(dy) >= all.Height())
        return false;
    surface->Scroll(all, dy);
    return true;
}

// Moves in several boxes, and after something else that is not shown yet, are rare: those are shown by their
// pixels.
void DrawingPort::NoteMove(std::vector<pixman_box32_t> const &boxes, int dx, int dy) {
    if (boxes.size() == 1 && touched.Empty() && !move) {
        move = PixelMove{{boxes[0].x1, boxes[0].y1, boxes[0].x2, boxes[0].y2}, dx, dy};
        return;
    }
    for (pixman_box32_t const &box : boxes)
        touched.Add({box.x1, box.y1, box.x2, box.y2});
}

std::vector<DeviceRect> DrawingPort::TakeTouched() {
    if (std::optional<PixelMove> const moved = TakeMove())
        touched.Add(moved->to);
    return touched.Take();
}

OSPort &OSPort::Current() {
    DrawingPort *port = DrawingPort::CurrentPort();
    BOOST_ASSERT(port != 0);
    if (port)
        return *port;
    static DrawingPort nowhere; // without a surface: takes every call and draws nothing
    return nowhere;
}

OSPort *OSPort::GetCurrent() { return DrawingPort::CurrentPort(); }

void OSPort::SetForeColor(RGBColor const &color) { SetForeColor(ToRGBA(color)); }

Rect GetLocalPortRect(OSPort *port) {
    if (!port)
        return {0, 0, 0, 0};
    DrawingPort const &drawing = *static_cast<DrawingPort *>(port);
    return drawing.WindowToLocal(drawing.Extent());
}
