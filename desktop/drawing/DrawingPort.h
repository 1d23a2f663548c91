// The drawing port of a window.
#pragma once
#include "desktop/drawing/DeviceScale.h"
#include "desktop/drawing/PixelMove.h"
#include "desktop/drawing/TouchedBoxes.h"
#include "host/Geometry.h"
#include "host/OSFont.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/PortSavers.h"
#include "host/RGBColor.h"
#include "host/VelaDrawing.h"
#include <functional>
#include <memory>
#include <optional>
#include <utility>
#include <vector>

class ClipPath;
class Surface;
struct pixman_box32;
typedef struct _cairo cairo_t;                 // NOLINT(bugprone-reserved-identifier): Cairo's own names
typedef struct _cairo_surface cairo_surface_t; // NOLINT(bugprone-reserved-identifier)

// What drawing depends on beside the pixels; the savers keep copies of parts of it.
struct GraphicsState {
    OS::RGBAColor fore;                     // opaque black
    OS::RGBAColor back{1.0, 1.0, 1.0, 1.0}; // opaque white
    PenState pen{{0, 0}, {1, 1}, 0, 0};     // location in local coordinates
    double lineWidth = 1.0;                 // logical pixels, for the outlines and paths of OSPort
    OS::Font::FamilyID textFamily;
    int textFace = 0;
    short textSize = 12;     // points, which are logical pixels
    int darken = 0;          // 0 draws plainly; else percent by which drawing darkens
    bool fadedIcons = false; // GrayForeColor with a light gray, as for what is disabled

    void SetFore(OS::RGBAColor const &color) {
        fore = color;
        fadedIcons = false;
    }
    // Makes the pen and the line 1 pixel wide; the pen stays where it is.
    void PenNormal();
};

// A clip as it is kept and put back.
struct ClipState {
    OSRgn region;                         // window coordinates
    std::shared_ptr<ClipPath const> path; // narrows the region further; null for none
};

// Where on a port drawing goes, to be put back later.
struct PortPlace {
    int originH = 0, originV = 0;
    OSRgn boundary; // window coordinates
    ClipState clip;
};

// The one OSPort there is. Logical pixels throughout; the surface is larger by the scale. Local coordinates
// are those of the window less the origin. Drawing outside the clip has no effect.
class DrawingPort : public OSPort {
public:
    DrawingPort();
    virtual ~DrawingPort();

    // The pixels and their scale; neither is owned. Drawing on a port without surface does nothing. Has to be
    // called, if need be with null, before the surface dies.
    void SetSurface(Surface *, DeviceScale);
    Surface *GetSurface() const { return surface; }
    // Another surface of the same size from here on, for the same pixels. Clip and state stay.
    void ExchangeSurface(Surface &);
    // A page of paper instead of pixels: everything becomes shapes, text and images on it. What the surface
    // takes for a pixel must be one of the scale. Not owned; null, like another surface, ends it.
    void SetPage(cairo_surface_t *, DeviceScale);
    bool IsPage() const { return page != nullptr; }
    DeviceScale Scale() const { return scale; }
    // The window's content in logical pixels, from (0, 0); cuts every clip and all damage. Boundary and clip
    // become all of it.
    void SetExtent(int width, int height);
    Rect Extent() const { return extent; }
    // Asked for the place of the window's content on the screen, in logical pixels, whenever somebody wants
    // to know. Without it the content is taken to lie in the corner of the screen.
    void SetScreenPlace(std::function<Point()> place) { screenPlace = std::move(place); }
    Point ScreenPlace() const { return screenPlace ? screenPlace() : Point{0, 0}; }

    // The port that the imperative calls use; null for none.
    static void MakeCurrent(DrawingPort *port) { current = port; }
    static DrawingPort *CurrentPort() { return current; }
    // The port, or null when it has died: windows close while a tracking loop further up keeps their port.
    static DrawingPort *Alive(OSPort *);

    // Origin of local coordinates in the window.
    void SetOrigin(int h, int v);
    int OriginH() const { return originH; }
    int OriginV() const { return originV; }

    // The widest clip that drawing may have, in window coordinates; makes it the clip as well.
    void SetBoundary(OSRgn const &);
    void SetBoundary(Rect const &);
    OSRgn const &Boundary() const { return boundary; }
    // The clip proper, in window coordinates; what is set is cut to the boundary. Forgets any path that
    // narrowed the clip.
    void SetClip(OSRgn const &);
    OSRgn const &Clip() const { return clip; }
    // The clip with its path, to be put back later.
    ClipState GetClipState() const { return {clip, clipPath}; }
    void SetClipState(ClipState const &);
    PortPlace GetPlace() const { return {originH, originV, boundary, GetClipState()}; }
    void SetPlace(PortPlace const &);
    // Leaves of the clip what lies in the rectangle or region too; window coordinates.
    void NarrowClipTo(Rect const &);
    void NarrowClipTo(OSRgn const &);
    // Whether drawing in the local rectangle could show.
    bool Visible(Rect const &local) const;

    GraphicsState &State() { return state; }
    GraphicsState const &State() const { return state; }
    // What shapes are drawn in: the foreground, or the shade that darkens by as much as the state says.
    OS::RGBAColor Ink() const;

    // Covers all of the clip with the colour, whatever the state. Need not do so at once: what is drawn next
    // comes to lie on it, but the surface has it only after FinishGround.
    void LayGround(OS::RGBAColor const &);
    void FinishGround();

    // What waits to be redrawn, in window coordinates. Damage takes a local rectangle.
    void Damage(Rect const &local);
    void DamageWindow(OSRgn const &);
    void DamageWindow(Rect window); // takes no memory of its own
    OSRgn const &GetDamage() const { return damage; }
    OSRgn TakeDamage();
    // Whether there is something to be redrawn or shown.
    bool HasWork() const;

    // The device pixels that have been drawn on since the last call, and so have to be shown: a few boxes
    // that cover them.
    std::vector<DeviceRect> TakeTouched();
    // The box is to be shown as if it had been drawn on.
    void Touch(DeviceRect const &box) { touched.Add(box); }
    // What ScrollRect moved since the last call of TakeTouched, where it is enough to move what is shown as
    // well, before the boxes that were drawn on are shown. Who takes it has to do that, or to touch the box.
    std::optional<PixelMove> TakeMove() { return std::exchange(move, std::nullopt); }

    Rect LocalToWindow(Rect const &) const; // saturates at the ends of 16 bits
    Rect WindowToLocal(Rect const &) const;

    // OSPort
    void FrameRect(OS::RectBase<OS::RectTag> const &) override;
    void FrameRoundRect(OS::RectBase<OS::RectTag> const &, OS::Size const &corner) override;
    void PaintRoundRect(OS::RectBase<OS::RectTag> const &, OS::Size const &corner) override;
    void PaintOval(OS::RectBase<OS::RectTag> const &) override;
    void StrokePath(OSPath const &) override;
    using OSPort::SetForeColor;
    void SetForeColor(OS::RGBAColor const &) override;
    void SetLineWidth(double) override;
    void NarrowClip(OS::RectBase<OS::RectTag> const &) override;
    void NarrowClipPath(OSPath const &) override;
    void PenNormal() override;
    void ScrollRect(OS::RectBase<OS::RectTag> const &, OS::Size const &) override;

private:
    friend class CairoScope;
    friend class PixelScope;
    friend class PortRef;
    struct Device; // clip in device pixels and the Cairo context, both made when first needed

    bool HasTarget() const { return surface || page; }
    // The size of what is drawn on, in device pixels.
    int DeviceWidth() const;
    int DeviceHeight() const;
    void ClipChanged();
    void CutClip(OSRgn const &);
    // Draws a smooth shape that lies in the local rectangle; user space is local logical coordinates.
    void DrawSmooth(Rect const &bounds, std::function<void(cairo_t *)> const &);
    // `line` is the width of a frame in device pixels; 0 fills.
    void DrawRoundRect(Rect const &bounds, OS::Size const &corner, int line);
    void MoveDevicePixels(OSRgn const &destination, int dh, int dv);
    bool ScrollPixels(DeviceRect const &to, int dy);
    void NoteMove(std::vector<pixman_box32> const &boxes, int dx, int dy);
    static DrawingPort *current;

    Surface *surface;
    cairo_surface_t *page;
    DeviceScale scale;
    Rect extent;
    int originH, originV;
    OSRgn boundary, clip, damage;
    std::shared_ptr<ClipPath const> clipPath;
    GraphicsState state;
    TouchedBoxes touched;
    std::optional<PixelMove> move; // before all that is touched
    std::function<Point()> screenPlace;
    std::unique_ptr<Device> device;
    unsigned long serial; // of all ports ever made
};

// A port that may die meanwhile.
class PortRef {
public:
    explicit PortRef(DrawingPort *port_)
        : port(port_)
        , serial(port_ ? port_->serial : 0) {}
    // Null when there was none, or when it is gone.
    DrawingPort *Get() const {
        DrawingPort *alive = DrawingPort::Alive(port);
        return alive && alive->serial == serial ? alive : nullptr; // another may stand at the same address
    }

private:
    DrawingPort *port;
    unsigned long serial;
};

// Cairo drawing on the current surface for the scope's lifetime: user space is local logical coordinates, the
// clip is the port's, the source is the port's ink. Null context when nothing of `bounds` (local) could show.
// The context's state is put back at the end. Scopes do not nest, and the port's clip stays as it is while
// one lives.
class CairoScope {
public:
    CairoScope(DrawingPort &, Rect const &bounds);
    ~CairoScope();
    CairoScope(CairoScope const &) = delete;
    CairoScope &operator=(CairoScope const &) = delete;
    cairo_t *Context() const { return context; }

private:
    DrawingPort &port;
    cairo_t *context;
};
