// Drawing by simple calls in whole pixels, all on the current port.
//
// Coordinates are those of the pane that is current. A rectangle's bottom and right edges are outside of it;
// one that is empty or upside down draws nothing. Lines and rectangles are drawn exactly, never blurred at
// their edges.
#pragma once
#include "host/Geometry.h"
#include "host/OSFont.h"
#include "host/RGBColor.h"

class OSPort;
class OSRgn;

// The pen: its place, its width and height in pixels, and how it marks. Only to be kept and put back.
struct PenState {
    Point location;
    Point size;
    short mode;
    short pattern;
};

namespace VelaDrawing {

// Writes the current port, or null when there is none.
void GetPort(OSPort **);

// Rectangles and points. These only calculate; the arguments must not be null.

// Moves each edge inwards, left and right by dh, top and bottom by dv; outwards when negative.
void InsetRect(Rect *, short dh, short dv);
// Moves the rectangle, right and down when positive.
void OffsetRect(Rect *, short dh, short dv);
// Writes what both rectangles share and answers whether that is anything; otherwise writes a rectangle of
// zeros. `out` may be one of the two.
bool SectRect(Rect const *, Rect const *, Rect *out);
// Whether the rectangle has no pixels.
bool EmptyRect(Rect const *);
// Whether the point is inside; the bottom and right edges are not.
bool PtInRect(Point, Rect const *);
// Writes the smallest rectangle with the two points as opposite corners, whichever is which.
void Pt2Rect(Point, Point, Rect *);
// Writes the direction from the rectangle's centre to the point: degrees from 0 to 359, clockwise, 0 upward.
// Measured in the rectangle's own proportions, so that its corners lie at 45, 135, 225 and 315 degrees
// whatever its shape.
void PtToAngle(Rect const *, Point, short *);
// Adds the first point to the second.
void AddPt(Point, Point *);
// Turns a point of the screen into one of the current port, and back.
void GlobalToLocal(Point *);
void LocalToGlobal(Point *);

// Pen, lines, rectangles. Drawing is in the foreground colour unless said otherwise.

// Puts the pen at the point.
void MoveTo(short h, short v);
// Moves the pen, right and down when positive.
void Move(short dh, short dv);
// Draws a line from the pen to the point, both ends included, and leaves the pen there. The pen hangs below
// and to the right of the line.
void LineTo(short h, short v);
// Outlines the rectangle just inside its edges, as thick as the pen.
void FrameRect(Rect const *);
void PaintRect(Rect const *);
// Fills the rectangle with the background colour.
void EraseRect(Rect const *);
// Makes the pen 1 by 1 pixel, solid, covering what is beneath. Its place stays.
void PenNormal();
// Writes the pen's place.
void GetPen(Point *);
void GetPenState(PenState *);
void SetPenState(PenState const *);

// Clip and invalidation.

// Replaces the clip by the rectangle. During an update nothing outside of what is being updated is drawn all
// the same.
void ClipRect(Rect const *);
// Copies the clip into the region; SetClip replaces the clip by a copy of the region.
void GetClip(OSRgn *);
void SetClip(OSRgn *);
// Leaves of the clip only what lies in the region or rectangle too. A null region stands for "everything": no
// effect.
void NarrowClip(OSRgn *);
void NarrowClipToRect(Rect const *);
// Marks part of the current pane, to be drawn at the next update. Nothing is drawn yet.
void InvalRect(Rect const *);
void InvalRgn(OSRgn *);

// Regions. The arguments must not be null unless said otherwise; a result may be one of the operands.

// A new, empty region; the caller frees it with DisposeRgn.
OSRgn *NewRgn();
void DisposeRgn(OSRgn *); // null: no effect
// Makes the region the rectangle.
void RectRgn(OSRgn *, Rect const *);
void UnionRgn(OSRgn *, OSRgn *, OSRgn *result);
// Writes the first less the second.
void DiffRgn(OSRgn *, OSRgn *, OSRgn *result);
// Whether the rectangle shares a pixel with the region. A null region stands for "everything": true.
bool RectInRgn(Rect const *, OSRgn *);

// Colours of the port. The background is what EraseRect fills with.

void RGBForeColor(RGBColor const &); // of what is drawn
void RGBBackColor(RGBColor const &); // of what is erased
void GetForeColor(RGBColor *);       // must not be null
void GetBackColor(RGBColor *);       // must not be null

// Text state of the port.

void TextFont(OS::Font::FamilyID); // the family
void TextSize(short);              // logical pixels
void TextFace(short);              // 0 plain, 1 bold, 32 condensed; the values add up
// The text state of any port, which must not be null.
OS::Font::FamilyID GetPortTextFont(OSPort *);
short GetPortTextSize(OSPort *);
int GetPortTextFace(OSPort *);
// Measures of the current port's font.
void GetFontInfo(TarnQuickDrawText::FontInfo *);

} // namespace VelaDrawing

// The current port's colours, as RGBForeColor and RGBBackColor set them, also with an alpha.
void SetForegroundColor(RGBColor const &);
void SetForegroundColor(OS::RGBAColor const &);
void SetBackgroundColor(RGBColor const &);
void SetBackgroundColor(OS::RGBAColor const &);

// Makes the colour a gray: percent of white, 0 black to 100 white; values beyond are cut to these. In a dark
// theme the scale runs the other way round, except on printed pages, so that 0 is what can be read best. A
// foreground of 50 or more also fades the icons that are drawn after it, until the next foreground colour.
void GrayForeColor(short);
void GrayBackColor(short);

// Writes the system's colour for selected text.
void GetHiliteColor(RGBColor *);
// Makes the system's colour for selections the foreground colour.
void SetUserHiliteColorAsForeColor();

// Draws a bevelled frame inside the rectangle. The depth is in pixels, negative for a sunken frame; the gray
// is that of the bevel in percent of white, or of black in a dark theme.
void Frame3DRect(Rect const *, short depth, short gray);
// Draws the inner shadow of a list below a horizontal line or to the right of a vertical one; other lines
// draw nothing.
void DrawShadowLine(Point, Point);
// Draws the frame of an editable text just inside the rectangle: an outline and, within it, as much paper,
// both one pixel wide.
void FrameTextWell(Rect const &);
