// The drawing port: where everything that a pane draws goes, in floating coordinates.
#pragma once
#include "host/Geometry.h"
#include "host/RGBColor.h"

class OSPath;

// One port belongs to each window. It carries the state of drawing: origin, clip, pen, colours and font.
// Coordinates are logical pixels of the pane that is current, set up by GlogPane::Prepare or by the host
// before DrawGuts; whole coordinates lie between pixels, so a rectangle from 0 to 10 covers 10 pixels.
//
// A rectangle of negative width or height means the same rectangle as with its edges exchanged. Nothing is
// drawn outside of the clip.
class OSPort {
public:
    virtual ~OSPort() {}

    // The port that drawing goes to now. There must be one.
    static OSPort &Current();
    // The same, or null when there is none. The port stays its window's.
    static OSPort *GetCurrent();

    // Outlines the rectangle just inside its edges, in the pen's width and the foreground colour.
    virtual void FrameRect(OS::RectBase<OS::RectTag> const &) = 0;
    // The same with rounded corners; the corner is the width and height of the ellipse that rounds them.
    virtual void FrameRoundRect(OS::RectBase<OS::RectTag> const &, OS::Size const &corner) = 0;
    // Fills the rectangle with rounded corners in the foreground colour.
    virtual void PaintRoundRect(OS::RectBase<OS::RectTag> const &, OS::Size const &corner) = 0;
    // Fills the ellipse that the rectangle encloses in the foreground colour.
    virtual void PaintOval(OS::RectBase<OS::RectTag> const &) = 0;
    // Draws along the path, half of the line width to either side, in the foreground colour, anti-aliased.
    virtual void StrokePath(OSPath const &) = 0;

    // The foreground colour for what is drawn from now on.
    virtual void SetForeColor(OS::RGBAColor const &) = 0;
    // The same, opaque: each component is divided by 65535 in single precision.
    void SetForeColor(RGBColor const &);
    // The pen's width in pixels, for outlines and paths. PenNormal makes it 1.
    virtual void SetLineWidth(double) = 0;

    // Leaves of the clip only what lies in the rectangle too.
    virtual void NarrowClip(OS::RectBase<OS::RectTag> const &) = 0;
    // Leaves of the clip only what lies inside the path too; open subpaths count as closed.
    virtual void NarrowClipPath(OSPath const &) = 0;

    // Gives the pen its normal state: 1 pixel wide and high, solid, covering what is beneath.
    virtual void PenNormal() = 0;

    // Moves the pixels within the rectangle by the size, in whole pixels: positive width to the right,
    // positive height down. What moves out of the rectangle is lost; what nothing moved into is invalidated
    // and drawn at the next update.
    virtual void ScrollRect(OS::RectBase<OS::RectTag> const &, OS::Size const &) = 0;
};

// The extent of the port's window content, in the port's current coordinates. The port must not be null.
Rect GetLocalPortRect(OSPort *);
