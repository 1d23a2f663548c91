// The drawing port of a window.
#pragma once
#include <memory>
#include "desktop/drawing/DeviceScale.h"
#include "host/Geometry.h"
#include "host/OSFont.h"
#include "host/OSPort.h"
#include "host/OSRgn.h"
#include "host/PortSavers.h"
#include "host/RGBColor.h"
#include "host/VelaDrawing.h"

class Surface;
typedef struct _cairo cairo_t;

// What drawing depends on beside the pixels; the savers keep copies of parts of it.
struct GraphicsState {
    OS::RGBAColor fore;                                    // opaque black
    OS::RGBAColor back{1.0, 1.0, 1.0, 1.0};                // opaque white
    PenState pen{{0, 0}, {1, 1}, 0, 0};                    // location in local coordinates
    double lineWidth = 1.0;                                // logical pixels, for StrokePath
    OS::Font::FamilyID textFamily;
    int textFace = 0;
    short textSize = 12;                                   // points, which are logical pixels
    int darken = 0;                                        // 0 draws plainly; else percent by which drawing darkens
};

// The one OSPort there is. Logical pixels throughout; the surface is larger by the scale. Local coordinates are those of the
// window less the origin. Drawing outside the clip has no effect.
class DrawingPort : public OSPort {
public:
    DrawingPort();
    virtual ~DrawingPort();

    // The pixels and their scale; neither is owned. Drawing on a port without surface does nothing.
    void SetSurface(Surface *, DeviceScale);
    Surface *GetSurface() const { return surface; }
    DeviceScale Scale() const { return scale; }
    // The window's content in logical pixels, from (0, 0); cuts every clip and all damage.
    void SetExtent(int width, int height);
    Rect Extent() const { return extent; }

    // The port that the imperative calls use; null for none.
    static void MakeCurrent(DrawingPort *);
    static DrawingPort *CurrentPort();

    // Origin of local coordinates in the window.
    void SetOrigin(int h, int v);
    int OriginH() const { return originH; }
    int OriginV() const { return originV; }

    // The widest clip that drawing may have, in window coordinates; makes it the clip as well.
    void SetBoundary(OSRgn const &);
    OSRgn const &Boundary() const { return boundary; }
    // The clip proper, in window coordinates; what is set is cut to the boundary.
    void SetClip(OSRgn const &);
    OSRgn const &Clip() const { return clip; }
    // Whether drawing in the local rectangle could show.
    bool Visible(Rect const &local) const;

    GraphicsState &State() { return state; }
    GraphicsState const &State() const { return state; }

    // What waits to be redrawn, in window coordinates. Damage takes a local rectangle.
    void Damage(Rect const &local);
    void DamageWindow(OSRgn const &);
    OSRgn const &GetDamage() const { return damage; }
    OSRgn TakeDamage();

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
    Surface *surface;
    DeviceScale scale;
    Rect extent;
    int originH, originV;
    OSRgn boundary, clip, damage;
    GraphicsState state;
    struct Device; // clip in device pixels and the Cairo context, both made when first needed
    std::unique_ptr<Device> device;
};

// Cairo drawing on the current surface for the scope's lifetime: user space is local logical coordinates, the clip is the port's,
// the source is the foreground colour. Null context when nothing of `bounds` (local) could show.
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
